// Runs the sides of one item in turn, round after round, and draws the row from what they took.
#pragma once

#include <string>
#include <vector>

#include "Item.h"

struct RoundSettings {
    int rounds = 5;
    double minSeconds = 0.05;  ///< least time of one side in one round
};

/// One side beside ours: its own median, and the median over the rounds of ours / its in the same round.
struct Opponent {
    std::string name;
    double nanoseconds = 0;
    double ratio = 0;
    double goal = 0;  ///< 0 where not asked

    bool isThere() const { return !name.empty(); }
    bool isMet() const { return !isThere() || goal == 0 || ratio <= goal; }
};

struct Row {
    std::string item;
    double oursNanoseconds = 0;
    Opponent peer;  ///< the fastest one
    Opponent limit;
    std::string error;  ///< why a side could not run; empty when all did

    bool isAsked() const { return (peer.isThere() && peer.goal > 0) || (limit.isThere() && limit.goal > 0); }
    bool isMet() const { return peer.isMet() && limit.isMet(); }
};

Row runItem(const Item& item, const RoundSettings& settings);

/// The middle of the values; the mean of the two middle ones when their number is even. None: 0.
double median(std::vector<double> values);
