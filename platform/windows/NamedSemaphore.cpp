#include "platform/NamedSemaphore.h"

#include <cstdio>

#include "platform/windows/SemaphoreCalls.h"

SemaphoreCalls semaphoreCalls;

namespace NamedSemaphore {
namespace {

constexpr DWORD fullAccess = 0x1F0003;

struct BasicInformation {
    ULONG current;
    ULONG maximum;
};
using QuerySemaphore = LONG(WINAPI*)(HANDLE, int informationClass, void* information, ULONG size, ULONG* returned);

PlatformSemaphore* toHandle(HANDLE handle) {
    return static_cast<PlatformSemaphore*>(handle);
}

/// The system library's reading call, which no import library declares; null where it is missing.
QuerySemaphore querySemaphore() {
    static const auto call = reinterpret_cast<QuerySemaphore>(
        reinterpret_cast<void*>(::GetProcAddress(::GetModuleHandleA("ntdll.dll"), "NtQuerySemaphore")));
    return call;
}

}  // namespace

PlatformSemaphore* open(const char* name) {
    return toHandle(semaphoreCalls.openSemaphore(fullAccess, FALSE, name));
}

PlatformSemaphore* create(const char* name, std::int32_t initial, std::int32_t maximum, bool* wasThere) {
    PlatformSemaphore* const living = open(name);
    if (wasThere != nullptr) {
        *wasThere = living != nullptr;
    }
    return living != nullptr ? living : toHandle(semaphoreCalls.createSemaphore(nullptr, initial, maximum, name));
}

PlatformSemaphore* duplicate(PlatformSemaphore* handle) {
    HANDLE second = nullptr;
    const HANDLE process = ::GetCurrentProcess();
    ::DuplicateHandle(process, handle, process, &second, 0, FALSE, DUPLICATE_SAME_ACCESS);
    return toHandle(second);
}

std::uint32_t take(PlatformSemaphore* handle) {
    return semaphoreCalls.waitForSingleObject(handle, 0);
}

bool release(PlatformSemaphore* handle, std::int32_t units, std::int32_t* previous) {
    static_assert(sizeof(LONG) == sizeof *previous);
    return semaphoreCalls.releaseSemaphore(handle, units, reinterpret_cast<LONG*>(previous)) != FALSE;
}

// Documentation asks for a release above 0, and there are systems that refuse to release nothing; those that allow it
// give the count by it.
bool count(PlatformSemaphore* handle, std::int32_t& value) {
    std::int32_t previous = 0;
    if (release(handle, 0, &previous)) {
        value = previous;
        return true;
    }
    BasicInformation information{};
    const QuerySemaphore query = querySemaphore();
    if (query == nullptr || query(handle, 0, &information, sizeof information, nullptr) < 0) {
        return false;
    }
    value = static_cast<std::int32_t>(information.current);
    return true;
}

void close(PlatformSemaphore* handle) {
    if (handle != nullptr) {
        semaphoreCalls.closeHandle(handle);
    }
}

int lastError() {
    return static_cast<int>(::GetLastError());
}

const char* explainLastError() {
    const int code = lastError();  // first, for what follows may ask the host too
    thread_local char text[32];
    std::snprintf(text, sizeof text, "error %d", code);
    return text;
}

}  // namespace NamedSemaphore
