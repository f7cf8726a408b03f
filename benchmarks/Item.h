// One row of the performance table: ours against its peers and against the limit of the machine, in one process.
//
//     const RegisterItem item{{"lock_unlock", {"Access", lockOurs}, {{"boost named_semaphore", lockBoost}},
//                              {"sem_trywait, sem_post", lockLimit}, 1.20, 1.20}};
//
// The sides of an item run in turn, round after round; a ratio is the median over the rounds of ours / theirs in the
// same round, and the peer of the table is the fastest one.
#pragma once

#include <benchmark/benchmark.h>

#include <vector>

using BenchmarkBody = void (*)(benchmark::State&);

struct Side {
    const char* name = nullptr;
    BenchmarkBody body = nullptr;
};

struct Item {
    const char* name;
    Side ours;
    std::vector<Side> peers;  ///< none where a peer is not asked for or not installed
    Side limit;               ///< no body where no limit is told
    double peerGoal = 0;      ///< at most this many times the fastest peer; 0 where not asked
    double limitGoal = 0;     ///< at most this many times the limit; 0 where not asked
};

struct RegisterItem {
    explicit RegisterItem(Item item);
};
