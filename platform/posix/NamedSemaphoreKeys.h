// The System V keys of a name. A name has two neighbouring keys, so that its semaphore finds a place where another name
// of the same hash, or another program, has taken one of them.
#pragma once

#include <sys/ipc.h>

#include <cstdint>

namespace NamedSemaphore {

constexpr key_t keysOfName = 2;

/// The first key of @p name; an even number, so that names either share all their keys and their lock or none.
inline key_t keyOfName(const char* name) {
    std::uint32_t hash = 2166136261U;  // FNV-1a
    for (; *name != '\0'; ++name) {
        hash = (hash ^ static_cast<unsigned char>(*name)) * 16777619U;
    }
    const std::uint32_t key = hash & ~1U;
    return static_cast<key_t>(key == IPC_PRIVATE ? 2U : key);  // IPC_PRIVATE, which is 0, names nothing
}

}  // namespace NamedSemaphore
