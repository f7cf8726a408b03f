#include "HkMessageManager.h"

#include <atomic>
#include <cstdarg>
#include <cstdio>
#include <memory>
#include <mutex>
#include <new>

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
    const Trace known = trace.load(std::memory_order_relaxed);
    return known == Trace::Unknown ? HkMessageManager::refreshTrace() : known == Trace::On;
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

/// Formats the text, on the stack where it fits, and sends the message on. A report never fails: a text that cannot be
/// formatted goes out as its bare format, one that there is no memory for as its beginning.
void formatAndDeliver(HkMessage message, const char* format, std::va_list arguments) {
    char shortText[512];
    std::unique_ptr<char[]> longText;
    std::va_list again;
    va_copy(again, arguments);
    const int written = std::vsnprintf(shortText, sizeof shortText, format != nullptr ? format : "", arguments);
    const std::size_t size = static_cast<std::size_t>(written) + 1;
    message.text = written >= 0 ? shortText : format;
    if (written >= 0 && size > sizeof shortText) {
        longText.reset(new (std::nothrow) char[size]);
    }
    if (longText != nullptr) {
        std::vsnprintf(longText.get(), size, format, again);
        message.text = longText.get();
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

bool HkMessageManager::refreshTrace() {
    const bool isOn = HkStr::ICompare(HkEnv::GetEnv(traceVariable), "ON") == 0;
    trace.store(isOn ? Trace::On : Trace::Off, std::memory_order_relaxed);
    return isOn;
}

}  // namespace HostKit
