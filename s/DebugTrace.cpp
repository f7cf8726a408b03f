#include "DebugTrace.h"

#include <cstdarg>
#include <cstdio>

#include "HkMessageManager.h"

DebugTrace::DebugTrace() : m_flag(HkMessageManager::refreshTrace() ? 1 : 0) {}

void DebugTrace::print(const char* format, ...) const {
    if (m_flag != 1 || format == nullptr) {
        return;
    }
    std::va_list arguments;
    va_start(arguments, format);
    std::vprintf(format, arguments);
    va_end(arguments);
}
