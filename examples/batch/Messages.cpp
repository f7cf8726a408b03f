#include "Messages.h"

#include <cstdio>
#include <cstring>
#include <utility>

#include "ProgressBar.h"

namespace {

bool isUsage(const char* text) {
    return std::strncmp(text, "usage: ", 7) == 0;
}

}  // namespace

Messages::Messages(std::string source)
    : m_source(std::move(source)), m_isTraced(HkStr::ICompare(HkEnv::GetEnv("ZRX_TESSAL_TRACE_FLAG"), "ON") == 0) {
    HkMessageManager::setHandler(&Messages::take, this);
}

Messages::~Messages() {
    HkMessageManager::setHandler(nullptr, nullptr);
}

void Messages::say(const std::string& text) const {
    write(place(), (text + "\n").c_str());
}

void Messages::sayOfAll(const std::string& text) const {
    write(m_source.empty() ? "" : m_source + ": ", (text + "\n").c_str());
}

void Messages::take(const HkMessage& message, void* context) {
    const Messages& messages = *static_cast<const Messages*>(context);
    if (message.level == HkMessageLevel::Status) {
        ProgressBar::makeRoom();
        std::fputs(message.text, stdout);
    } else if (message.level == HkMessageLevel::Debug) {
        messages.write("", messages.m_isTraced ? message.text : "");
    } else if (messages.m_source.empty() || !isUsage(message.text)) {
        messages.write(messages.place(), message.text);
    }
}

void Messages::write(const std::string& place, const char* text) const {
    ProgressBar::makeRoom();
    std::fflush(stdout);
    std::fprintf(stderr, "%s%s", place.c_str(), text);
    std::fflush(stderr);
}

std::string Messages::place() const {
    return m_source.empty() ? "" : m_source + ":" + std::to_string(m_line) + ": ";
}
