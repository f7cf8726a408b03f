#include "platform/posix/OpenFailure.h"

#include <array>
#include <cerrno>
#include <cstdio>
#include <cstring>
#include <system_error>

#include "platform/posix/SystemV.h"

namespace OpenFailure {
namespace {

thread_local std::array<char, 256> text{};

struct Advice {
    int error;
    const char* callPrefix;
    const char* words;
};

constexpr Advice advices[] = {
    {ENOSPC, "sem", "; the machine has no free semaphore set, see kernel.sem and ipcs -s"},
    {ENOSPC, "shm", "; the machine has no free shared segment, see kernel.shmmni, kernel.shmall and ipcs -m"},
    {EACCES, "", "; another user's object of this key is closed to others, see ipcs"},
    {EINVAL, "semget", "; another program's semaphore set has its key, see ipcs -s"},
    {EPERM, "", "; this process may not use System V objects"},
    {ENOSYS, "", "; this host has no System V objects"},
};

const char* adviceFor(const char* call, int error) {
    for (const Advice& advice : advices) {
        if (advice.error == error && std::strncmp(call, advice.callPrefix, std::strlen(advice.callPrefix)) == 0) {
            return advice.words;
        }
    }
    return "";
}

}  // namespace

void noteHostCall() {
    const int error = errno;
    const char* const call = SystemV::lastCall;
    std::snprintf(text.data(), text.size(), "%s: %s%s", call, std::generic_category().message(error).c_str(),
                  adviceFor(call, error));
}

void noteBusy(int holder) {
    std::snprintf(text.data(), text.size(), "process %d stands still while it opens or closes it", holder);
}

void note(const char* words) {
    std::snprintf(text.data(), text.size(), "%s", words);
}

const char* words() {
    return text.data();
}

}  // namespace OpenFailure
