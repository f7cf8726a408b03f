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

TEST_F(AccessScripted, AsksWithTheseArguments) {
    semaphoreCalls.openSemaphore = [](DWORD access, BOOL inherited, LPCSTR name) -> HANDLE {
        EXPECT_EQ(access, 0x1F0003U);
        EXPECT_FALSE(inherited);
        EXPECT_STREQ(name, "CableShareCount1060");
        return nullptr;
    };
    semaphoreCalls.createSemaphore = [](LPSECURITY_ATTRIBUTES security, LONG initial, LONG maximum,
                                        LPCSTR name) -> HANDLE {
        EXPECT_EQ(security, nullptr);
        EXPECT_EQ(initial, 5);
        EXPECT_EQ(maximum, 5);
        EXPECT_STREQ(name, "CableShareCount1060");
        return reinterpret_cast<HANDLE>(0xAB0);
    };
    semaphoreCalls.waitForSingleObject = [](HANDLE, DWORD bound) -> DWORD {
        EXPECT_EQ(bound, 0U);
        return WAIT_TIMEOUT;
    };
    static int closed = 0;
    semaphoreCalls.closeHandle = [](HANDLE handle) -> BOOL {
        return handle == reinterpret_cast<HANDLE>(0xAB0) && ++closed;
    };
    const MessageRecorder messages;
    EXPECT_EQ(Access(1060, Access::COUNT).decCount(), 0);
    EXPECT_EQ(closed, 1);
    EXPECT_THAT(messages.debug(),
                ElementsAre(" Semaphore name = CableShareCount1060.\n", " Creating semaphore, id=0x00000AB0.\n"));
}

TEST_F(AccessScripted, StandsWithoutASemaphoreWhereTheHostGivesNone) {
    semaphoreCalls.openSemaphore = [](DWORD, BOOL, LPCSTR) -> HANDLE { return nullptr; };
    semaphoreCalls.createSemaphore = [](LPSECURITY_ATTRIBUTES, LONG, LONG, LPCSTR) -> HANDLE {
        ::SetLastError(ERROR_ACCESS_DENIED);
        return nullptr;
    };
    const MessageRecorder messages;
    const Access access(100, Access::SHARE);
    EXPECT_THAT(messages.info(), ElementsAre("Semaphore CableSharing100 is not available: error 5.\n"));
    EXPECT_THAT(messages.debug(),
                ElementsAre(" Semaphore name = CableSharing100.\n", " Creating semaphore, id=0x00000000.\n"));
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
    EXPECT_THAT(messages.debug(), ElementsAre(" Cable Client Count = 5.\n", "Wait Abandoned in Access.\n",
                                              "Invalid WaitForSingleObject result = 0x77.\n"));
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
