#include "StepHook.h"

#include <signal.h>

#include <cerrno>
#include <cstring>

#include "platform/posix/SystemV.h"

namespace StepHook {
namespace {

struct {
    Action action;
    int step;
    const char* call;
    int error;
    int made;
} state;

bool pass(const char* call) {
    if (state.call != nullptr && std::strcmp(call, state.call) != 0) {
        return true;
    }
    if (++state.made != state.step) {
        return true;
    }
    switch (state.action) {
        case Action::Kill:
            ::raise(SIGKILL);
            return true;
        case Action::Stop:
            ::raise(SIGSTOP);
            return true;
        case Action::Fail:
            errno = state.error;
            return false;
    }
    return true;
}

}  // namespace

void arm(Action action, int step, const char* call, int error) {
    state = {action, step, call, error, 0};
    SystemV::filter = &pass;
}

void disarm() {
    SystemV::filter = nullptr;
}

}  // namespace StepHook
