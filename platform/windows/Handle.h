// Owner of a kernel handle.
#pragma once

#include <windows.h>

#include "platform/Owner.h"

namespace platform {

struct HandleRules {
    using Value = HANDLE;
    static HANDLE none() { return INVALID_HANDLE_VALUE; }
    static bool isOpen(HANDLE handle) { return handle != INVALID_HANDLE_VALUE && handle != nullptr; }
    static bool close(HANDLE handle) { return CloseHandle(handle) != FALSE; }
};

using Handle = Owner<HandleRules>;

}  // namespace platform
