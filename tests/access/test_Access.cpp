// What Access promises on both hosts, within one process and between several real ones.
#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include <atomic>
#include <thread>
#include <utility>
#include <vector>

#include "Access.h"
#include "MessageRecorder.h"
#include "Port.h"
#include "platform/NamedSemaphore.h"

using testing::AnyOf;
using testing::ElementsAre;
using testing::IsEmpty;
using testing::StartsWith;

namespace {

template <class Body>
void inThreads(Body body) {
    std::vector<std::thread> threads;
    for (int i = 0; i < 4; ++i) {
        threads.emplace_back(body);
    }
    for (std::thread& thread : threads) {
        thread.join();
    }
}

}  // namespace

TEST(AccessId, HasAFamilyForEachPortName) {
    struct {
        const char* name;
        int port;
        int share;
        int count;
    } const cases[] = {{"LPT", 0, 120, 1020},  {"USB", 0, 140, 1040},  {"usb2", 1, 161, 1061},  {"Com", 19, 199, 1099},
                       {"LPT1", 0, 100, 1000}, {"", 3, 100, 1000},     {nullptr, 3, 100, 1000}, {"US", 1, 100, 1000},
                       {"LPT", 20, 140, 1040}, {"LPT", -20, 100, 1000}};
    for (const auto& row : cases) {
        SCOPED_TRACE(row.name != nullptr ? row.name : "(null)");
        EXPECT_EQ(Access::generatePortId(row.name, row.port, Access::SHARE), row.share);
        EXPECT_EQ(Access::generatePortId(row.name, row.port, Access::COUNT), row.count);
    }
}

TEST(AccessShare, ExcludesOthersUntilGivenBack) {
    const int port = freshPort();
    Access first(port, Access::SHARE);
    Access second(port, Access::SHARE);
    const MessageRecorder messages;
    EXPECT_FALSE(first.unlock());
    EXPECT_TRUE(first.lock());
    EXPECT_FALSE(second.lock());
    EXPECT_FALSE(second.unlock());
    EXPECT_TRUE(first.unlock());
    EXPECT_TRUE(second.lock());
    EXPECT_FALSE(second.lock());  // and no longer counts as the holder
    EXPECT_FALSE(second.unlock());
    EXPECT_TRUE(first.cleanLock());
    EXPECT_THAT(messages.all(), IsEmpty());
    EXPECT_FALSE(first.cleanLock());
    EXPECT_THAT(messages.status(), ElementsAre(" ReleaseSemaphore rc = 298.\n"));
}

TEST(AccessCount, CountsFiveClients) {
    const int port = freshPort();
    Access access(port, Access::COUNT);
    const MessageRecorder messages;
    EXPECT_EQ(access.incCount(), 0);
    EXPECT_THAT(messages.status(), ElementsAre(" Count ReleaseSemaphore rc = 298.\n"));
    EXPECT_EQ(access.getNormalizedCount(), 0);
    for (int client = 1; client <= 5; ++client) {
        EXPECT_EQ(Access(port, Access::COUNT).decCount(), 1);  // destroying detaches nobody
        EXPECT_EQ(access.getNormalizedCount(), client);
    }
    EXPECT_EQ(access.decCount(), 0);
    EXPECT_EQ(access.incCount(), 1);
    EXPECT_EQ(access.getNormalizedCount(), 4);
    EXPECT_EQ(messages.status().size(), 1U);
}

TEST(Access, TellsItsWorkInDebugLines) {
    const int port = freshPort();
    const MessageRecorder messages;
    Access::generatePortId("LPT1", 0, Access::SHARE);
    Access first(port, Access::COUNT);
    const Access second(port, Access::COUNT);
    first.incCount();
    first.getNormalizedCount();
    const std::string name = " Semaphore name = CableShareCount" + std::to_string(port) + ".\n";
    EXPECT_THAT(messages.debug(),
                ElementsAre(" Generating id for LPT1, port 0. share type = SHARE\n",
                            "Invalid port name: LPT1. shar type = 0.\n", name, StartsWith(" Creating semaphore, id=0x"),
                            name, StartsWith(" Reusing semaphore, id=0x"), " Cable Client Count = 5.\n",
                            " Cable Normalized Count = 0.\n"));
}

TEST(Access, CopiesAreIndependentAndHoldNothing) {
    const int port = freshPort();
    Access holder(port, Access::SHARE);
    ASSERT_TRUE(holder.lock());
    {
        Access copy(holder);
        EXPECT_FALSE(copy.unlock());
        EXPECT_FALSE(copy.lock());
        Access other(freshPort(), Access::SHARE);
        EXPECT_TRUE(other.lock());
        other = copy;
        EXPECT_FALSE(other.lock());
    }
    EXPECT_FALSE(Access(port, Access::SHARE).lock());
    EXPECT_TRUE(holder.unlock());
}

TEST(Access, MovingTakesTheUnitAlongAndTheEndOfItsHolderGivesItBack) {
    const int port = freshPort();
    const Access keeper(port, Access::SHARE);  // without it, the last handle's end would free the port
    std::vector<Access> held;
    held.emplace_back(port, Access::SHARE);
    EXPECT_TRUE(held.front().lock());
    held.emplace_back(freshPort(), Access::SHARE);  // which moves the first to new memory
    EXPECT_FALSE(isFree(port));
    held.front() = std::move(held.back());
    EXPECT_TRUE(isFree(port));
    Access& self = held.front();
    Access& again = self;  // a compiler refuses to be shown that it is the same
    self = std::move(again);
    EXPECT_TRUE(self.lock());
}

TEST(Access, WorksOnWithoutASemaphore) {
    Access source(freshPort(), Access::SHARE);
    const Access taken(std::move(source));
    const MessageRecorder messages;
    EXPECT_FALSE(source.lock());
    EXPECT_FALSE(source.unlock());
    EXPECT_FALSE(source.cleanLock());
    EXPECT_EQ(source.decCount(), 0);
    EXPECT_EQ(source.incCount(), 0);
    EXPECT_EQ(source.getNormalizedCount(), 5);
    const Access copy(source);
    EXPECT_THAT(messages.status(), ElementsAre(" ReleaseSemaphore rc = 6.\n", " Count ReleaseSemaphore rc = 6.\n"));
}

TEST(NamedSemaphore, KeepsTheCountsOfTheOneThatLives) {
    const std::string name = "tessal test " + std::to_string(freshPort());
    EXPECT_EQ(NamedSemaphore::open(name.c_str()), nullptr);
    EXPECT_EQ(NamedSemaphore::lastError(), NamedSemaphore::notFound);
    PlatformSemaphore* const first = NamedSemaphore::create(name.c_str(), 3, 4);
    PlatformSemaphore* const second = NamedSemaphore::create(name.c_str(), 1, 1);
    std::int32_t previous = -1;
    EXPECT_TRUE(NamedSemaphore::release(second, 1, &previous));
    EXPECT_EQ(previous, 3);
    EXPECT_FALSE(NamedSemaphore::release(first, 2, &previous));
    EXPECT_FALSE(NamedSemaphore::release(first, -1, nullptr));
    EXPECT_TRUE(NamedSemaphore::count(first, previous));
    EXPECT_EQ(previous, 4);
    NamedSemaphore::close(first);
    NamedSemaphore::close(second);
    EXPECT_EQ(NamedSemaphore::open(name.c_str()), nullptr);
}

TEST(NamedSemaphore, RefusesWhatCannotBe) {
    EXPECT_EQ(NamedSemaphore::create("tessal test", 2, 1), nullptr);
    EXPECT_EQ(NamedSemaphore::create("tessal test", -1, 1), nullptr);
    EXPECT_EQ(NamedSemaphore::create("tessal test", 0, 0), nullptr);
    EXPECT_EQ(NamedSemaphore::create(std::string(1000, 'x').c_str(), 1, 1), nullptr);
    EXPECT_STRNE(NamedSemaphore::explainLastError(), "");
}

TEST(AccessProcesses, KilledHolderLeavesTheCountToThoseWhoRemain) {
    const int port = freshPort();
    Access keeper(port, Access::SHARE);
    const auto holder = startPortUser(port);
    ASSERT_EQ(holder->ask("lock"), "1");
    holder->kill();
    EXPECT_FALSE(keeper.lock());
    EXPECT_EQ(startPortUser(port)->ask("lock"), "0");
    EXPECT_TRUE(keeper.cleanLock());
    EXPECT_TRUE(keeper.lock());
}

TEST(AccessProcesses, KilledClientsKeepTheirSlotsUntilTheLastOneGoes) {
    const int port = freshPort();
    const auto first = startPortUser(port, Access::COUNT);
    const auto second = startPortUser(port, Access::COUNT);
    EXPECT_EQ(first->ask("dec") + second->ask("dec"), "11");
    first->kill();
    EXPECT_EQ(second->ask("clients"), "2");
    second->kill();
    EXPECT_EQ(Access(port, Access::COUNT).getNormalizedCount(), 0);
}

// The role "stepper" opens, locks, gives back and closes a port, and is killed at one of its steps: at each call of the
// host, and while it holds the port.
TEST(AccessSteps, KilledAtEachHostCallLeavesTheCountToThoseWhoRemainOrAFreshPort) {
    for (const bool isKept : {false, true}) {
        const int port = freshPort();
        int status = -1;
        for (int step = 1; status != 0 && step < 100; ++step) {
            SCOPED_TRACE("step " + std::to_string(step) + (isKept ? " beside a holder" : ""));
            std::vector<Access> keepers;
            if (isKept) {
                keepers.emplace_back(port, Access::SHARE);
                ASSERT_TRUE(keepers.front().lock());
            }
            status = ChildProcess::start("stepper", {std::to_string(port), std::to_string(step)})->wait();
            ASSERT_THAT(status, AnyOf(-1, 0)) << "neither killed nor done";
            ASSERT_EQ(isFree(port), !isKept);
            ASSERT_TRUE(!isKept || keepers.front().unlock());
            ASSERT_TRUE(isFree(port));
            keepers.clear();
            ASSERT_TRUE(isNothingLeft(port));
        }
        EXPECT_EQ(status, 0);
    }
}

// Not among the cases for ThreadSanitizer: it does not see that the kernel's semaphore keeps the openers apart.
TEST(Access, ManyAtOnceOpenAndCloseOneName) {
    const int port = freshPort();
    std::atomic<int> holders{0};
    std::atomic<int> faults{0};
    inThreads([&] {
        for (int round = 0; round < 300; ++round) {
            Access access(port, Access::SHARE);
            if (access.lock()) {
                faults += ++holders != 1;
                --holders;
                faults += !access.unlock();
            }
        }
    });
    EXPECT_EQ(faults, 0);
    EXPECT_TRUE(isNothingLeft(port));
}

TEST(AccessThreads, NeverReleasePastTheMaximum) {
    const int port = freshPort();
    Access observer(port, Access::COUNT);
    std::atomic<int> given{0};
    std::atomic<int> taken{0};
    inThreads([&] {
        Access access(port, Access::COUNT);
        PlatformSemaphore* const units = NamedSemaphore::open(("CableShareCount" + std::to_string(port)).c_str());
        for (int round = 0; round < 10000; ++round) {
            given += NamedSemaphore::release(units, 1, nullptr);
            taken += access.decCount();
        }
        NamedSemaphore::close(units);
    });
    EXPECT_EQ(observer.getNormalizedCount(), taken - given);
    EXPECT_GE(taken - given, 0);
    EXPECT_LE(taken - given, 5);
}
