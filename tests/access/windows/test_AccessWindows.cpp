// What the Windows body asks of the host, and what it makes of a host that refuses.
#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include "../Port.h"
#include "Access.h"
#include "MessageRecorder.h"
#include "host/Role.h"
#include "platform/NamedSemaphore.h"
#include "platform/windows/SemaphoreCalls.h"

using testing::ElementsAre;

namespace {

struct AccessScripted : testing::Test {
    ~AccessScripted() override { semaphoreCalls = SemaphoreCalls{}; }
};

int callsLeft = 0;

/// Ends the process before the last of the calls that are left. No two of them are of one type.
template <class Result, class... Arguments>
void countCalls(Result(WINAPI*& call)(Arguments...)) {
    static Result(WINAPI* const real)(Arguments...) = call;
    call = [](Arguments... arguments) -> Result {
        if (--callsLeft == 0) {
            ::TerminateProcess(::GetCurrentProcess(), 0xDEAD);
        }
        return real(arguments...);
    };
}

/// Opens, locks, gives back and closes a port, and is killed before one of its host calls.
const Role stepper{"stepper", [](const RoleArguments& arguments) {
                       callsLeft = std::stoi(arguments.at(1));
                       countCalls(semaphoreCalls.openSemaphore);
                       countCalls(semaphoreCalls.createSemaphore);
                       countCalls(semaphoreCalls.waitForSingleObject);
                       countCalls(semaphoreCalls.releaseSemaphore);
                       countCalls(semaphoreCalls.closeHandle);
                       Access access(std::stoi(arguments.at(0)), Access::SHARE);
                       access.lock();
                       access.unlock();
                       return 0;
                   }};

}  // namespace

TEST_F(AccessScripted, StandsWithoutASemaphoreWhereTheHostGivesNone) {
    semaphoreCalls.openSemaphore = [](DWORD, BOOL inherited, LPCSTR) -> HANDLE {
        EXPECT_FALSE(inherited);
        return nullptr;
    };
    semaphoreCalls.createSemaphore = [](LPSECURITY_ATTRIBUTES security, LONG, LONG, LPCSTR) -> HANDLE {
        EXPECT_EQ(security, nullptr);
        ::SetLastError(ERROR_ACCESS_DENIED);
        return nullptr;
    };
    const MessageRecorder messages;
    const Access access(100, Access::SHARE);
    EXPECT_THAT(messages.info(), ElementsAre("Semaphore CableSharing100 is not available: error 5.\n"));
}

TEST_F(AccessScripted, TellsFailingWaitsAndReleases) {
    Access access(freshPort(), Access::SHARE);
    ASSERT_TRUE(access.lock());
    const MessageRecorder messages;
    semaphoreCalls.releaseSemaphore = [](HANDLE, LONG, LPLONG) -> BOOL {
        ::SetLastError(ERROR_ACCESS_DENIED);
        return FALSE;
    };
    EXPECT_FALSE(access.unlock());
    EXPECT_FALSE(access.unlock());  // no longer held: no second message
    EXPECT_EQ(access.incCount(), 0);
    semaphoreCalls.waitForSingleObject = [](HANDLE, DWORD) -> DWORD { return WAIT_ABANDONED; };
    EXPECT_FALSE(access.lock());
    semaphoreCalls.waitForSingleObject = [](HANDLE, DWORD) -> DWORD { return 0x77; };
    EXPECT_EQ(access.decCount(), 0);
    EXPECT_THAT(messages.status(), ElementsAre(" ReleaseSemaphore rc = 5.\n", " Count ReleaseSemaphore rc = 5.\n"));
}

TEST_F(AccessScripted, ReadsTheCountWhereReleasingNothingIsRefused) {
    Access access(freshPort(), Access::COUNT);
    ASSERT_EQ(access.decCount() + access.decCount(), 2);
    semaphoreCalls.releaseSemaphore = [](HANDLE handle, LONG units, LPLONG previous) -> BOOL {
        ::SetLastError(ERROR_INVALID_PARAMETER);
        return units > 0 ? ::ReleaseSemaphore(handle, units, previous) : FALSE;
    };
    EXPECT_EQ(access.getNormalizedCount(), 2);
    EXPECT_EQ(access.incCount(), 4);
    EXPECT_EQ(access.getNormalizedCount(), 1);
}

bool isNothingLeft(int port) {
    PlatformSemaphore* const left = NamedSemaphore::open(("CableSharing" + std::to_string(port)).c_str());
    NamedSemaphore::close(left);
    return left == nullptr;
}
