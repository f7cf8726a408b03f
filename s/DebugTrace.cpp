#include "DebugTrace.h"

#include <cstdarg>
#include <cstdio>

#include "HkEnv.h"
#include "HkMessageManager.h"
#include "HkStr.h"

DebugTrace::DebugTrace() {
    const char* const value = HkEnv::GetEnv("ZRX_TESSAL_TRACE_FLAG");
    m_flag = value != nullptr && HkStr::ICompare(value, "ON") == 0 ? 1 : 0;
    HkMessageManager::refreshTrace();
}

void DebugTrace::print(const char* format, ...) const {
    if (m_flag != 1 || format == nullptr) {
        return;
    }
    std::va_list arguments;
    va_start(arguments, format);
    std::vprintf(format, arguments);
    va_end(arguments);
}
