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

#include "Access.h"
#include "Port.h"
#include "host/Role.h"
#include "host/SharedFile.h"

namespace {

using Clock = std::chrono::steady_clock;

constexpr int maxWorkers = 500;  // in one round, those that take a killed one's place included

/// What outlives a killed worker.
struct Board {
    std::atomic<int> finish;
    std::atomic<int> holder;  ///< number of the worker that drives the port now; 0 for none
    std::atomic<int> working[maxWorkers + 1];
    std::atomic<int> doomed[maxWorkers + 1];
    std::atomic<int> openings;
    std::atomic<int> locks;
    std::atomic<int> faults;
};

class Worker {
public:
    Worker(Board& board, int number, int port, unsigned seed)
        : m_board(board), m_number(number), m_port(port), m_random(seed) {}

    void work() {
        m_board.working[m_number] = 1;
        do {
            Access share(m_port, Access::SHARE);
            Access count(m_port, Access::COUNT);
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
            expect(m_board.doomed[other] != 0, "two holders");
            m_board.holder = m_number;
        }
        const auto longest = m_random() % 4 == 0 ? 100000U : 500U;
        for (auto pause = m_random() % longest; pause > 0; --pause) {
            expect(m_board.holder == m_number, "another holder came in");
        }
        m_board.holder = 0;
        expect(share.unlock(), "somebody else gave the unit back");
    }

    void useCount(Access& count) {
        if (count.decCount() == 1) {
            const int clients = count.getNormalizedCount();
            expect(clients >= 1 && clients <= 5, "a wrong number of clients");
            expect(count.incCount() > 0, "a slot too many");
        }
    }

    void expect(bool holds, const char* fault) {
        if (!holds) {
            ++m_board.faults;
            std::fprintf(stderr, "worker %d on port %d: %s\n", m_number, m_port, fault);
        }
    }

    Board& m_board;
    int m_number;
    int m_port;
    std::mt19937 m_random;
};

const Role worker{"torture worker", [](const RoleArguments& arguments) {
                      const SharedFile file(arguments.at(0), sizeof(Board));
                      const int number = std::stoi(arguments.at(1));
                      const auto seed = static_cast<unsigned>(std::stoul(arguments.at(3)));
                      Worker(file.as<Board>(), number, std::stoi(arguments.at(2)), seed).work();
                      return 0;
                  }};

struct Totals {
    int rounds = 0;
    int kills = 0;
    int killedHolders = 0;
    long openings = 0;
    long locks = 0;
    int faults = 0;
};

/// One round; half of them keep a handle of their own, so that the semaphore lives through them, and
/// half of them kill.
class Round {
public:
    Round(int number, std::mt19937& random, Totals& totals)
        : m_path(testing::TempDir() + "tessal_torture_" + std::to_string(freshPort())),
          m_file(m_path, sizeof(Board)),
          m_board(m_file.as<Board>()),
          m_port(freshPort()),
          m_isKept(number % 2 != 0),
          m_hasKills(number % 4 >= 2),
          m_random(random),
          m_totals(totals) {}
    Round(const Round&) = delete;
    Round& operator=(const Round&) = delete;

    ~Round() { std::remove(m_path.c_str()); }

    void run(std::chrono::milliseconds duration) {
        std::vector<Access> keepers;
        if (m_isKept) {
            keepers.emplace_back(m_port, Access::SHARE);
            keepers.emplace_back(m_port, Access::COUNT);
        }
        for (std::size_t place = 0; place < workers; ++place) {
            start(place);
        }
        awaitWorkers();
        const auto end = Clock::now() + duration;
        do {
            std::this_thread::sleep_for(std::chrono::microseconds(m_random() % 5000));
            if (m_hasKills) {
                killOne();
            }
        } while (Clock::now() < end && m_started < maxWorkers);
        finish();
        if (m_isKept) {
            checkKept(keepers.front(), keepers.back());
            keepers.clear();
        }
        checkFresh();
        addUp();
    }

private:
    static constexpr std::size_t workers = 4;

    void start(std::size_t place) {
        m_numbers.at(place) = ++m_started;
        m_workers.at(place) = ChildProcess(
            "torture worker", {m_path, std::to_string(m_started), std::to_string(m_port), std::to_string(m_random())});
    }

    /// A loaded machine takes its time to start programs, which is no part of the round.
    void awaitWorkers() {
        const auto end = Clock::now() + std::chrono::seconds(60);
        for (const int number : m_numbers) {
            while (m_board.working[number] == 0 && Clock::now() < end) {
                std::this_thread::sleep_for(std::chrono::milliseconds(1));
            }
            expect(m_board.working[number] != 0, "a worker did not start");
        }
    }

    void killOne() {
        const std::size_t place = m_random() % workers;
        const int number = m_numbers.at(place);
        if (m_board.working[number] == 0) {
            return;
        }
        m_board.doomed[number] = 1;  // before it dies, so that nobody takes what it leaves for a fault
        m_workers.at(place).kill();
        m_killedHolders += m_board.holder == number;
        ++m_kills;
        start(place);
    }

    void finish() {
        m_board.finish = 1;
        for (ChildProcess& process : m_workers) {
            expect(process.wait() == 0, "a worker did not come to its end");
        }
    }

    void checkKept(Access& share, Access& count) {
        const bool isWhole = share.lock();
        expect(isWhole || m_kills > 0, "the unit is lost");
        expect(!isWhole || !share.lock(), "there are two units");
        expect(count.getNormalizedCount() <= m_kills, "slots are lost");
    }

    void checkFresh() {
        expect(isFree(m_port), "the port is blocked");
        expect(Access(m_port, Access::COUNT).getNormalizedCount() == 0, "slots outlive their clients");
        expect(isNothingLeft(m_port), "the semaphore outlives its handles");
    }

    void addUp() {
        ++m_totals.rounds;
        m_totals.kills += m_kills;
        m_totals.killedHolders += m_killedHolders;
        m_totals.openings += m_board.openings;
        m_totals.locks += m_board.locks;
        m_totals.faults += m_board.faults;
        expect(m_kills > 0 || m_board.locks > 0, "nobody got the port");
    }

    void expect(bool holds, const char* fault) {
        if (!holds) {
            ++m_totals.faults;
            std::fprintf(stderr, "round %d, port %d, %d kills: %s\n", m_totals.rounds, m_port, m_kills, fault);
        }
    }

    const std::string m_path;
    SharedFile m_file;
    Board& m_board;
    const int m_port;
    const bool m_isKept;
    const bool m_hasKills;
    std::mt19937& m_random;
    Totals& m_totals;
    std::array<ChildProcess, workers> m_workers;
    std::array<int, workers> m_numbers{};
    int m_started = 0;
    int m_kills = 0;
    int m_killedHolders = 0;
};

Totals torture(int seconds, unsigned seed) {
    std::mt19937 random(seed);
    Totals totals;
    const auto end = Clock::now() + std::chrono::seconds(seconds);
    while (Clock::now() < end || totals.rounds < 4) {
        Round(totals.rounds, random, totals).run(std::chrono::milliseconds(seconds < 20 ? 300 : 2000));
    }
    std::printf("torture: seed %u, %d rounds, %d kills (%d of holders), %ld openings, %ld locks, %d faults\n", seed,
                totals.rounds, totals.kills, totals.killedHolders, totals.openings, totals.locks, totals.faults);
    return totals;
}

const Role byHand{"torture", [](const RoleArguments& arguments) {
                      const unsigned seed = arguments.size() > 1 ? static_cast<unsigned>(std::stoul(arguments[1]))
                                                                 : std::random_device{}();
                      return torture(std::stoi(arguments.at(0)), seed).faults == 0 ? 0 : 1;
                  }};

}  // namespace

TEST(AccessTorture, FindsNoFault) {
    const char* const seconds = std::getenv("TESSAL_TORTURE_SECONDS");
    const Totals totals = torture(seconds != nullptr ? std::atoi(seconds) : 4, std::random_device{}());
    EXPECT_EQ(totals.faults, 0);
    EXPECT_GT(totals.kills, 0);
}
