#include "platform/posix/OpenFailure.h"

#include <array>
#include <cerrno>
#include <cstdio>
#include <cstring>
#include <system_error>

#include "platform/posix/SystemV.h"

namespace OpenFailure {
namespace {

/// Put into words when somebody asks only: most opens meet refusals that are no failure.
struct Failure {
    const char* words;
    const char* call;  ///< the call that failed, and its errno; null where it was none
    int error;
    int holder;  ///< who stands still in the opening lock; 0 for nobody
};

thread_local Failure last{};
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
    last = {"", SystemV::lastCall, errno, 0};
}

void noteBusy(int holder) {
    last = {"", nullptr, 0, holder};
}

void note(const char* words) {
    last = {words, nullptr, 0, 0};
}

const char* words() {
    if (last.call != nullptr) {
        std::snprintf(text.data(), text.size(), "%s: %s%s", last.call,
                      std::generic_category().message(last.error).c_str(), adviceFor(last.call, last.error));
        return text.data();
    }
    if (last.holder != 0) {
        std::snprintf(text.data(), text.size(), "process %d stands still while it opens or closes it", last.holder);
        return text.data();
    }
    return last.words != nullptr ? last.words : "";
}

}  // namespace OpenFailure
