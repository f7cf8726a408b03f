// What can go wrong with a lock between processes on a POSIX host, one test a fault.
#include <dlfcn.h>
#include <gmock/gmock.h>
#include <gtest/gtest.h>
#include <sched.h>
#include <signal.h>
#include <sys/stat.h>
#include <sys/wait.h>
#include <unistd.h>

#include <cerrno>
#include <chrono>
#include <cstring>
#include <fstream>
#include <functional>
#include <iostream>

#include "../Port.h"
#include "Access.h"
#include "MessageRecorder.h"
#include "host/Role.h"
#include "host/posix/Forked.h"
#include "platform/NamedSemaphore.h"
#include "platform/posix/CountSegment.h"
#include "platform/posix/NamedSemaphoreKeys.h"
#include "platform/posix/SystemV.h"

using testing::ElementsAre;
using testing::HasSubstr;

namespace {

/// What happens at one host call of this process: at the n-th from now on or, unless its name is null, the n-th of it.
struct Step {
    int left;
    int signal;  ///< 0 for a failure
    const char* call;
    int error;
} step;

bool passStep(const char* call) {
    if ((step.call != nullptr && std::strcmp(call, step.call) != 0) || --step.left != 0) {
        return true;
    }
    errno = step.error;
    return step.signal != 0 && ::raise(step.signal) == 0;
}

void setStep(const Step& next) {
    step = next;
    SystemV::filter = &passStep;
}

key_t keyOf(int port) {
    return NamedSemaphore::keyOfName(("CableSharing" + std::to_string(port)).c_str());
}

/// Opens, locks, gives back and closes a port, and is ended, or stopped if told so, at one of the host calls on that
/// way.
const Role stepper{"stepper", [](const RoleArguments& arguments) {
                       setStep({std::stoi(arguments.at(1)), arguments.size() > 2 ? SIGSTOP : SIGKILL, nullptr, 0});
                       std::cout << ::getpid() << std::endl;
                       Access access(std::stoi(arguments.at(0)), Access::SHARE);
                       access.lock();
                       passStep("none: it holds the port");
                       access.unlock();
                       return 0;
                   }};

}  // namespace

bool isNothingLeft(int port) {
    const key_t key = keyOf(port);
    return ::shmget(key, 0, 0) == -1 && ::shmget(key + 1, 0, 0) == -1 && ::semget(key, 0, 0) == -1;
}

TEST(AccessSteps, StoppedInsideTheOpeningLockDelaysOthersForABoundedTime) {
    const int port = freshPort();
    const auto stopped = ChildProcess::start("stepper", {std::to_string(port), "6", "stop"});
    const pid_t process = std::stoi(stopped->read());
    siginfo_t info{};
    ASSERT_EQ(::waitid(P_PID, static_cast<id_t>(process), &info, WSTOPPED), 0);
    const MessageRecorder messages;
    const auto start = std::chrono::steady_clock::now();
    EXPECT_FALSE(Access(port, Access::SHARE).lock());
    EXPECT_LT(std::chrono::steady_clock::now() - start, std::chrono::seconds(10));
    EXPECT_THAT(messages.info(), ElementsAre(HasSubstr("process " + std::to_string(process) + " stands still")));
    ::kill(process, SIGCONT);
    EXPECT_EQ(stopped->wait(), 0);
    EXPECT_TRUE(isFree(port));
    EXPECT_TRUE(isNothingLeft(port));
}

TEST(AccessSteps, EachHostCallMayFail) {
    const int port = freshPort();
    const char* const calls[] = {"shmget", "shmat", "shmctl(IPC_STAT)", "madvise", "semget", "semtimedop"};
    for (const int error : {ENOSPC, EACCES, ENOMEM, ENOSYS}) {
        for (const char* const call : calls) {
            for (int number = 1; number <= 4; ++number) {
                SCOPED_TRACE(std::string(call) + " " + std::to_string(number) + " " + std::to_string(error));
                const MessageRecorder messages;
                {
                    setStep({number, 0, call, error});
                    Access access(port, Access::SHARE);
                    const bool opened = messages.info().empty();
                    EXPECT_EQ(access.lock(), opened);
                    EXPECT_TRUE(opened || messages.info().front().find(call) != std::string::npos)
                        << messages.info().front();
                    SystemV::filter = nullptr;
                }
                ASSERT_TRUE(isFree(port));
            }
        }
    }
    EXPECT_TRUE(isNothingLeft(port));
}

TEST(AccessFork, ChildNeitherGivesBackNorTakes) {
    const int port = freshPort();
    Access access(port, Access::SHARE);
    ASSERT_TRUE(access.lock());
    const MessageRecorder silence;
    const int ended = inChild([&] {
        access.~Access();  // as in a child that returns while the object counts as the holder
        return 0;
    });
    EXPECT_EQ(ended, 0);
    EXPECT_FALSE(isFree(port));
    const int status = inChild([&] {
        Access copy(access);
        Access own(port, Access::SHARE);
        const bool isInert = !access.unlock() && !access.cleanLock() && !access.lock() && !copy.lock() && !own.lock();
        access.~Access();  // the parent's object ends here; the child goes on without it
        return isInert && own.cleanLock() && own.lock() ? 0 : 1;  // which its destructor gives back
    });
    EXPECT_EQ(status, 0);
    EXPECT_TRUE(access.lock());
}

TEST(AccessFork, ChildDoesNotKeepThePortOfItsKilledParent) {
    for (const bool executes : {false, true}) {
        const int port = freshPort();
        const auto hold = [port] {
            static Access access(port, Access::SHARE);
            return access.lock();
        };
        const Orphan child(hold, executes);
        EXPECT_TRUE(isFree(port)) << executes;
        EXPECT_TRUE(isNothingLeft(port)) << executes;
    }
}

TEST(AccessUsers, ShareAPortWhateverTheUmaskAndLeaveItsRemovalToTheNextOneWhereTheyMayNot) {
    const int port = freshPort();
    const int closed = inChild([&] {
        ::umask(0777);
        Access access(port, Access::SHARE);
        const bool isHeld = access.lock();
        return !becomeAnotherUser() ? 77 : isHeld ? 0 : 1;
    });
    if (closed == 77) {
        GTEST_SKIP() << "needs the right to become another user";
    }
    EXPECT_EQ(closed, 0);
    EXPECT_EQ(inChild([&] { return becomeAnotherUser() && isFree(port) ? 0 : 1; }), 0);
    EXPECT_FALSE(isNothingLeft(port));
    EXPECT_TRUE(isFree(port));
    EXPECT_TRUE(isNothingLeft(port));
}

TEST(AccessKeys, CollidingNamesAreToldApart) {
    const char* const first = "tessal collision 167598";
    const char* const second = "tessal collision 289787";
    const key_t key = NamedSemaphore::keyOfName(first);
    ASSERT_EQ(key, NamedSemaphore::keyOfName(second));
    PlatformSemaphore* const one = NamedSemaphore::create(first, 0, 1);
    PlatformSemaphore* const two = NamedSemaphore::create(second, 1, 1);
    EXPECT_EQ(NamedSemaphore::take(one), NamedSemaphore::timedOut);
    NamedSemaphore::close(one);
    PlatformSemaphore* const again = NamedSemaphore::create(second, 1, 1);  // not at the place that is free now
    EXPECT_EQ(NamedSemaphore::take(two), NamedSemaphore::taken);
    EXPECT_EQ(NamedSemaphore::take(again), NamedSemaphore::timedOut);
    NamedSemaphore::close(two);
    NamedSemaphore::close(again);
    EXPECT_EQ(::semget(key, 0, 0), -1);
}

TEST(AccessKeys, ObjectsOfOtherProgramsAreLeftAlone) {
    const int port = freshPort();
    const int segment = ::shmget(keyOf(port), 8192, IPC_CREAT | 0666);
    EXPECT_TRUE(isFree(port));  // beside it
    EXPECT_NE(::shmget(keyOf(port), 0, 0), -1);
    ::shmctl(segment, IPC_RMID, nullptr);
    EXPECT_TRUE(isFree(port));
    EXPECT_TRUE(isNothingLeft(port));
    const int set = ::semget(keyOf(port), 1, IPC_CREAT | 0666);
    const MessageRecorder messages;
    EXPECT_FALSE(isFree(port));
    EXPECT_THAT(messages.info(), ElementsAre(HasSubstr("another program's semaphore set has its key")));
    EXPECT_EQ(::semctl(set, 0, GETVAL), 0);
    ::semctl(set, 0, IPC_RMID);
    EXPECT_TRUE(isFree(port));
}

TEST(AccessKeys, IdentifierZeroAndTheMachinesLimits) {
    const int port = freshPort();
    const int status = inChild([&] {
        if (::unshare(CLONE_NEWIPC) != 0) {
            return 77;
        }
        const Access first(port, Access::SHARE);
        Access second(port, Access::SHARE);
        const bool isZero = ::shmget(keyOf(port), 0, 0) == 0 && second.lock() && !isFree(port);
        std::ofstream("/proc/sys/kernel/shmmni") << 1;
        const MessageRecorder messages;
        const bool refused = !isFree(port + 1) && messages.info().front().find("kernel.shmmni") != std::string::npos;
        return isZero && refused ? 0 : 1;
    });
    if (status == 77) {
        GTEST_SKIP() << "needs the right to make a name space of its own";
    }
    EXPECT_EQ(status, 0);
}

TEST(AccessDamage, OverwrittenCountsAndNamesHurtNobody) {
    for (const std::int32_t garbage : {-1, 2, INT32_MIN, INT32_MAX}) {
        const int port = freshPort();
        Access access(port, Access::SHARE);
        auto* const segment = static_cast<CountSegment*>(::shmat(::shmget(keyOf(port), 0, 0), nullptr, 0));
        segment->count = garbage;
        segment->maximum = garbage;
        segment->name[0] ^= garbage == 2 ? 1 : 0;
        const MessageRecorder messages;
        access.lock();
        access.unlock();
        access.cleanLock();
        access.incCount();
        access.getNormalizedCount();
        isFree(port);
        ::shmdt(segment);
    }
}

TEST(AccessCopies, TwoCopiesOfTheLibraryInOneProcessExcludeEachOther) {
    const int port = freshPort();
    void* const module = ::dlopen(ACCESS_COPY, RTLD_NOW | RTLD_LOCAL);
    ASSERT_NE(module, nullptr) << ::dlerror();
    const auto open = reinterpret_cast<void (*)(int, std::function<bool()>&)>(::dlsym(module, "copyOpen"));
    {
        Access ours(port, Access::SHARE);
        std::function<bool()> theirs;
        open(port, theirs);
        EXPECT_TRUE(theirs());
        EXPECT_FALSE(ours.lock());
        EXPECT_EQ(inChild([&] { return theirs() ? 1 : 0; }), 0);
        theirs = nullptr;
        EXPECT_TRUE(ours.lock());
    }
    EXPECT_TRUE(isNothingLeft(port));
    ::dlclose(module);
    EXPECT_EQ(inChild([] { return 0; }), 0);  // the fork handlers of the unloaded copy are gone too
}
