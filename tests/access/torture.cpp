// Several processes open, lock, give back and close one port without a pause, while the parent kills one or another at
// random moments and starts a new one in its place. Each round has a port of its own and checks: at most one holder,
// no unit lost, nobody blocked, and a fresh port when all are gone. TESSAL_TORTURE_SECONDS makes it last longer.
#include <gtest/gtest.h>

#include <array>
#include <atomic>
#include <chrono>
#include <cstdio>
#include <cstdlib>
#include <iostream>
#include <random>
#include <thread>

#include "Access.h"
#include "Port.h"
#include "TemporaryDirectory.h"
#include "host/Role.h"
#include "host/SharedFile.h"

namespace {

using Clock = std::chrono::steady_clock;

constexpr int maxWorkers = 500;  // in one round, those that take a killed one's place included

/// What outlives a killed worker.
struct Board {
    std::atomic<int> port;
    std::atomic<int> finish;
    std::atomic<int> holder;  ///< number of the worker that drives the port now; 0 for none
    std::atomic<int> doomed[maxWorkers + 1];
    std::atomic<int> locks;
    std::atomic<int> faults;

    void expect(bool holds, const char* fault) {
        if (!holds) {
            ++faults;
            std::fprintf(stderr, "torture of port %d: %s\n", port.load(), fault);
        }
    }
};

class Worker {
public:
    Worker(Board& board, int number, unsigned seed) : m_board(board), m_number(number), m_random(seed) {}

    void work() {
        std::cout << "working" << std::endl;
        do {
            Access share(m_board.port, Access::SHARE);
            Access count(m_board.port, Access::COUNT);
            for (auto rounds = 1 + m_random() % 20; rounds > 0; --rounds) {
                useShare(share);
                useCount(count);
            }
        } while (m_board.finish == 0);
    }

private:
    void useShare(Access& share) {
        if (!share.lock()) {
            return;
        }
        ++m_board.locks;
        int other = 0;
        if (!m_board.holder.compare_exchange_strong(other, m_number)) {
            m_board.expect(m_board.doomed[other] != 0, "two holders");
            m_board.holder = m_number;
        }
        const auto longest = m_random() % 4 == 0 ? 100000U : 500U;
        for (auto pause = m_random() % longest; pause > 0; --pause) {
            m_board.expect(m_board.holder == m_number, "another holder came in");
        }
        m_board.holder = 0;
        m_board.expect(share.unlock(), "somebody else gave the unit back");
    }

    void useCount(Access& count) {
        if (count.decCount() == 1) {
            const int clients = count.getNormalizedCount();
            m_board.expect(clients >= 1 && clients <= 5, "a wrong number of clients");
            m_board.expect(count.incCount() > 0, "a slot too many");
        }
    }

    Board& m_board;
    int m_number;
    std::mt19937 m_random;
};

const Role worker{"torture worker", [](const RoleArguments& arguments) {
                      const SharedFile file(arguments.at(0), sizeof(Board));
                      const auto seed = static_cast<unsigned>(std::stoul(arguments.at(2)));
                      Worker(file.as<Board>(), std::stoi(arguments.at(1)), seed).work();
                      return 0;
                  }};

/// A port and those who work on it.
class Round {
public:
    Round() { m_board.port = freshPort(); }

    int port() const { return m_board.port; }
    int kills() const { return m_started - static_cast<int>(m_places.size()); }

    void work(bool hasKills, Clock::duration time) {
        for (Place& place : m_places) {
            start(place);
        }
        const auto end = Clock::now() + time;
        for (std::size_t turn = 0; hasKills && Clock::now() < end && m_started < maxWorkers; ++turn) {
            replace(m_places.at(turn % m_places.size()));
        }
        std::this_thread::sleep_until(end);
        m_board.finish = 1;
        for (const Place& place : m_places) {
            EXPECT_EQ(place.process->wait(), 0) << "a worker did not come to its end";
        }
        EXPECT_TRUE(hasKills || m_board.locks > 0) << "nobody got the port";
        EXPECT_EQ(m_board.faults, 0);
    }

    void expectWhole(Access& share, Access& count) const {
        const bool isWhole = share.lock();
        EXPECT_TRUE(isWhole || kills() > 0) << "the unit is lost";
        EXPECT_FALSE(isWhole && share.lock()) << "there are two units";
        EXPECT_LE(count.getNormalizedCount(), kills()) << "slots are lost";
    }

    void expectFreshPort() const {
        EXPECT_TRUE(isFree(port())) << "the port is blocked";
        EXPECT_EQ(Access(port(), Access::COUNT).getNormalizedCount(), 0) << "slots outlive their clients";
        EXPECT_TRUE(isNothingLeft(port())) << "the semaphore outlives its handles";
    }

private:
    struct Place {
        int number;
        std::unique_ptr<ChildProcess> process;
    };

    void start(Place& place) {
        const std::string number = std::to_string(++m_started);
        place = {m_started, ChildProcess::start("torture worker", {m_path, number, std::to_string(m_random())})};
    }

    /// Kills one that is at work, at any moment of it.
    void replace(Place& place) {
        EXPECT_EQ(place.process->read(), "working");
        std::this_thread::sleep_for(std::chrono::microseconds(m_random() % 5000));
        m_board.doomed[place.number] = 1;  // before it dies, so that nobody takes what it leaves for a fault
        place.process->kill();
        start(place);
    }

    const TemporaryDirectory m_directory;
    const std::string m_path = m_directory / "board";
    const SharedFile m_file{m_path, sizeof(Board)};
    Board& m_board = m_file.as<Board>();
    std::mt19937 m_random{std::random_device{}()};
    std::array<Place, 4> m_places{};
    int m_started = 0;
};

}  // namespace

// Half of the rounds keep a handle of their own, so that the semaphore lives through them, and half of them kill.
TEST(AccessTorture, FindsNoFault) {
    const char* const told = std::getenv("TESSAL_TORTURE_SECONDS");
    const std::chrono::seconds time(told != nullptr ? std::atoi(told) : 4);
    const std::chrono::milliseconds timeOfRound(time < std::chrono::seconds(20) ? 300 : 2000);
    const auto end = Clock::now() + time;
    int kills = 0;
    for (int number = 0; number < 4 || Clock::now() < end; ++number) {
        Round round;
        std::vector<Access> keepers;
        if (number % 2 != 0) {
            keepers.emplace_back(round.port(), Access::SHARE);
            keepers.emplace_back(round.port(), Access::COUNT);
        }
        round.work(number % 4 >= 2, timeOfRound);
        if (!keepers.empty()) {
            round.expectWhole(keepers.front(), keepers.back());
            keepers.clear();
        }
        round.expectFreshPort();
        kills += round.kills();
    }
    EXPECT_GT(kills, 0);
}
