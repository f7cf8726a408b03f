#include "platform/posix/OpeningLock.h"

#include <cerrno>

#include "platform/posix/OpenFailure.h"
#include "platform/posix/SystemV.h"

namespace {

using Clock = std::chrono::steady_clock;
using std::chrono::milliseconds;

/// Only the first semaphore of a set is used. Their unusual number tells our sets from those of other programs that
/// happen to have the key.
constexpr int setSize = 7;

sembuf operation(short change, short flags) {
    return {0, change, flags};
}

timespec toTimespec(milliseconds span) {
    const auto seconds = std::chrono::duration_cast<std::chrono::seconds>(span);
    return {seconds.count(), std::chrono::nanoseconds(span - seconds).count()};
}

bool isGone(int error) {
    return error == EINVAL || error == EIDRM;
}

}  // namespace

OpeningLock::OpeningLock(key_t key, milliseconds bound, WhereAbsent whereAbsent) {
    const auto end = Clock::now() + bound;
    milliseconds left = bound;
    while (tryOnce(key, left, whereAbsent) == Step::Again) {
        left = std::chrono::duration_cast<milliseconds>(end - Clock::now());
        if (left <= milliseconds(0)) {
            OpenFailure::note("it is opened and closed by others without end");
            return;
        }
    }
}

OpeningLock::~OpeningLock() {
    if (isHeld()) {
        letGo();
    }
}

OpeningLock::Step OpeningLock::tryOnce(key_t key, milliseconds left, WhereAbsent whereAbsent) {
    const int flags = whereAbsent == WhereAbsent::Make ? IPC_CREAT | SystemV::everyone : 0;
    const int set = SystemV::getSet(key, setSize, flags);
    if (set == -1) {
        OpenFailure::noteHostCall();
        return Step::GivenUp;
    }
    sembuf waitAndHold[] = {operation(0, 0), operation(1, SEM_UNDO)};
    const timespec bound = toTimespec(left);
    if (SystemV::operate(set, waitAndHold, 2, bound) == -1) {
        if (isGone(errno) || errno == EINTR) {
            return Step::Again;
        }
        if (errno == EAGAIN) {
            OpenFailure::noteBusy(SystemV::lastUser(set));
        } else {
            OpenFailure::noteHostCall();
        }
        return Step::GivenUp;
    }
    m_set = set;
    // While this process stood between the two calls, the set may have been removed, and its identifier given to
    // another.
    semid_ds state{};
    const bool isOfKey = SystemV::inspectSet(set, state) == 0 && state.sem_perm.__key == key;
    if (isOfKey && state.sem_nsems == setSize) {
        return Step::Held;
    }
    letGo();
    m_set = none;
    OpenFailure::note("another program's semaphore set has its key, see ipcs -s");
    return isOfKey ? Step::GivenUp : Step::Again;
}

void OpeningLock::letGo() const {
    sembuf release = operation(-1, IPC_NOWAIT | SEM_UNDO);
    SystemV::operateAtOnce(m_set, release);
}

void OpeningLock::remove() {
    if (SystemV::removeSet(m_set) == -1) {
        letGo();
    }
    m_set = none;
}
