// Several processes open, lock, give back and close one port without a pause, while the parent kills one or another at
// random moments and starts a new one in its place. Each round has a port of its own and checks: at most one holder,
// no unit lost, nobody blocked, and a fresh port when all are gone.
//
// By hand, for an hour: test_access --role torture 3600 [seed]
#include <gtest/gtest.h>

#include <array>
#include <atomic>
#include <chrono>
#include <cstdio>
#include <cstdlib>
#include <iostream>
#include <random>
#include <thread>
#include <utility>

#include "Access.h"
#include "Port.h"
#include "TemporaryDirectory.h"
#include "host/Role.h"
#include "host/SharedFile.h"

namespace {

using std::chrono::milliseconds;

constexpr int maxWorkers = 500;  // in one round, those that take a killed one's place included

/// What outlives a killed worker.
struct Board {
    std::atomic<int> port;
    std::atomic<int> finish;
    std::atomic<int> holder;  ///< number of the worker that drives the port now; 0 for none
    std::atomic<int> doomed[maxWorkers + 1];
    // Of all rounds:
    std::atomic<int> openings;
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
            ++m_board.openings;
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

class Torture {
public:
    explicit Torture(unsigned seed) : m_random(seed) {}

    int faults() const { return m_board.faults; }

    /// Half of the rounds keep a handle of their own, so that the semaphore lives through them, and half of them kill.
    void run(std::chrono::seconds time) {
        const auto end = Clock::now() + time;
        const milliseconds timeOfRound(time < std::chrono::seconds(20) ? 300 : 2000);
        int rounds = 0;
        for (; rounds < 4 || Clock::now() < end; ++rounds) {
            runRound(rounds % 2 != 0, rounds % 4 >= 2, timeOfRound);
        }
        m_board.expect(m_kills > 0, "nobody was killed");
        std::printf("torture: %d rounds, %d kills (%d of holders), %d openings, %d locks, %d faults\n", rounds, m_kills,
                    m_killedHolders, m_board.openings.load(), m_board.locks.load(), faults());
    }

private:
    using Clock = std::chrono::steady_clock;

    struct Place {
        int number;
        std::unique_ptr<ChildProcess> process;
        bool isWorking;
    };

    void runRound(bool isKept, bool hasKills, milliseconds time) {
        prepareBoard();
        const int locks = m_board.locks;
        std::vector<Access> keepers;
        if (isKept) {
            keepers.emplace_back(m_board.port, Access::SHARE);
            keepers.emplace_back(m_board.port, Access::COUNT);
        }
        for (Place& place : m_places) {
            start(place);
        }
        for (Place& place : m_places) {
            await(place);
        }
        const auto end = Clock::now() + time;
        for (std::size_t turn = 0; Clock::now() < end && m_started < maxWorkers; ++turn) {
            Place& place = m_places.at(turn % m_places.size());
            await(place);
            std::this_thread::sleep_for(std::chrono::microseconds(m_random() % 5000));
            if (hasKills) {
                kill(place);
            }
        }
        finish();
        m_board.expect(hasKills || m_board.locks > locks, "nobody got the port");
        if (isKept) {
            checkKept(keepers.front(), keepers.back());
            keepers.clear();
        }
        checkFresh();
    }

    void prepareBoard() {
        m_board.port = freshPort();
        m_board.finish = 0;
        m_board.holder = 0;
        for (std::atomic<int>& mark : m_board.doomed) {
            mark = 0;
        }
        m_started = 0;
    }

    void start(Place& place) {
        const std::string number = std::to_string(++m_started);
        place = {m_started, ChildProcess::start("torture worker", {m_path, number, std::to_string(m_random())}), false};
    }

    /// A loaded machine takes its time to start programs, which is no part of the round.
    void await(Place& place) {
        if (!std::exchange(place.isWorking, true)) {
            m_board.expect(place.process->read() == "working", "a worker did not start");
        }
    }

    void kill(Place& place) {
        m_board.doomed[place.number] = 1;  // before it dies, so that nobody takes what it leaves for a fault
        place.process->kill();
        m_killedHolders += m_board.holder == place.number;
        ++m_kills;
        start(place);
    }

    void finish() {
        m_board.finish = 1;
        for (const Place& place : m_places) {
            m_board.expect(place.process->wait() == 0, "a worker did not come to its end");
        }
    }

    void checkKept(Access& share, Access& count) {
        const int kills = m_started - static_cast<int>(m_places.size());
        const bool isWhole = share.lock();
        m_board.expect(isWhole || kills > 0, "the unit is lost");
        m_board.expect(!isWhole || !share.lock(), "there are two units");
        m_board.expect(count.getNormalizedCount() <= kills, "slots are lost");
    }

    void checkFresh() {
        m_board.expect(isFree(m_board.port), "the port is blocked");
        m_board.expect(Access(m_board.port, Access::COUNT).getNormalizedCount() == 0, "slots outlive their clients");
        m_board.expect(isNothingLeft(m_board.port), "the semaphore outlives its handles");
    }

    const TemporaryDirectory m_directory;
    const std::string m_path = m_directory / "board";
    const SharedFile m_file{m_path, sizeof(Board)};
    Board& m_board = m_file.as<Board>();
    std::mt19937 m_random;
    std::array<Place, 4> m_places{};
    int m_started = 0;  ///< in this round
    int m_kills = 0;
    int m_killedHolders = 0;
};

/// Gives the number of faults.
int torture(int seconds, unsigned seed) {
    std::printf("torture: seed %u\n", seed);
    Torture rounds(seed);
    rounds.run(std::chrono::seconds(seconds));
    return rounds.faults();
}

const Role byHand{"torture", [](const RoleArguments& arguments) {
                      const unsigned seed = arguments.size() > 1 ? static_cast<unsigned>(std::stoul(arguments[1]))
                                                                 : std::random_device{}();
                      return torture(std::stoi(arguments.at(0)), seed) == 0 ? 0 : 1;
                  }};

}  // namespace

TEST(AccessTorture, FindsNoFault) {
    const char* const seconds = std::getenv("TESSAL_TORTURE_SECONDS");
    EXPECT_EQ(torture(seconds != nullptr ? std::atoi(seconds) : 4, std::random_device{}()), 0);
}
