#include "HkMessageManager.h"

#include <atomic>
#include <cstdarg>
#include <cstdio>
#include <mutex>
#include <string>

#include "HkEnv.h"
#include "HkStr.h"

namespace HostKit {
namespace {

constexpr const char* traceVariable = "ZRX_TESSAL_TRACE_FLAG";

enum class Trace : int { Unknown, Off, On };

// The state is constant-initialised and never destroyed, so that other units may report before and after main.
std::atomic<Trace> trace{Trace::Unknown};
std::atomic<bool> handled{false};

struct Outlet {
    std::recursive_mutex mutex;
    HkMessageHandler handler = nullptr;
    void* context = nullptr;
};

Outlet& outlet() {
    static Outlet& instance = *new Outlet;
    return instance;
}

bool isTraced() {
    if (trace.load(std::memory_order_relaxed) == Trace::Unknown) {
        HkMessageManager::refreshTrace();
    }
    return trace.load(std::memory_order_relaxed) == Trace::On;
}

void writeToConsole(const HkMessage& message) {
    if (message.level == HkMessageLevel::Debug && !isTraced()) {
        return;
    }
    std::FILE* const stream = message.level == HkMessageLevel::Status ? stdout : stderr;
    std::fputs(message.text, stream);
}

void deliver(const HkMessage& message) {
    Outlet& out = outlet();
    const std::lock_guard<std::recursive_mutex> guard(out.mutex);
    if (out.handler != nullptr) {
        out.handler(message, out.context);
    } else {
        writeToConsole(message);
    }
}

/// Formats the text, on the stack where it fits, and sends the message on.
void formatAndDeliver(HkMessage message, const char* format, std::va_list arguments) {
    char shortText[512];
    std::va_list again;
    va_copy(again, arguments);
    const int length = std::vsnprintf(shortText, sizeof shortText, format != nullptr ? format : "", arguments);
    std::string longText;
    message.text = shortText;
    if (length < 0) {
        message.text = format;  // cannot be formatted: better the bare words than nothing
    } else if (static_cast<std::size_t>(length) >= sizeof shortText) {
        longText.resize(static_cast<std::size_t>(length));
        std::vsnprintf(longText.data(), longText.size() + 1, format, again);
        message.text = longText.c_str();
    }
    va_end(again);
    deliver(message);
}

}  // namespace

HkMessageManager& HkMessageManager::createObject(const char* module, const char* file, int line, const char* revision) {
    thread_local HkMessageManager manager;
    manager.m_message = HkMessage{HkMessageLevel::Status, module, file, line, revision, nullptr};
    return manager;
}

void HkMessageManager::issueError(const char* format, ...) {
    std::va_list arguments;
    va_start(arguments, format);
    m_message.level = HkMessageLevel::Error;
    formatAndDeliver(m_message, format, arguments);
    va_end(arguments);
}

void HkMessageManager::issueInfo(const char* format, ...) {
    std::va_list arguments;
    va_start(arguments, format);
    m_message.level = HkMessageLevel::Info;
    formatAndDeliver(m_message, format, arguments);
    va_end(arguments);
}

void HkMessageManager::issueStatus(const char* format, ...) {
    std::va_list arguments;
    va_start(arguments, format);
    m_message.level = HkMessageLevel::Status;
    formatAndDeliver(m_message, format, arguments);
    va_end(arguments);
}

void HkMessageManager::debugStub(const char* format, ...) {
    if (!isDebugHeard()) {
        return;
    }
    std::va_list arguments;
    va_start(arguments, format);
    formatAndDeliver(HkMessage{HkMessageLevel::Debug, nullptr, nullptr, 0, nullptr, nullptr}, format, arguments);
    va_end(arguments);
}

void HkMessageManager::setHandler(HkMessageHandler handler, void* context) {
    Outlet& out = outlet();
    const std::lock_guard<std::recursive_mutex> guard(out.mutex);
    out.handler = handler;
    out.context = context;
    handled.store(handler != nullptr, std::memory_order_relaxed);
}

bool HkMessageManager::isDebugHeard() {
    return handled.load(std::memory_order_relaxed) || isTraced();
}

void HkMessageManager::refreshTrace() {
    const char* const value = HkEnv::GetEnv(traceVariable);
    const bool on = value != nullptr && HkStr::ICompare(value, "ON") == 0;
    trace.store(on ? Trace::On : Trace::Off, std::memory_order_relaxed);
}

}  // namespace HostKit
