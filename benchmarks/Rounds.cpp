#include "Rounds.h"

#include <algorithm>

namespace {

struct Timing {
    double nanoseconds = 0;
    benchmark::IterationCount iterations = 0;
    std::string error;
};

// Takes what one run reports and prints nothing.
class TimingReporter : public benchmark::BenchmarkReporter {
public:
    bool ReportContext(const Context&) override { return true; }

    void ReportRuns(const std::vector<Run>& runs) override {
        for (const Run& run : runs) {
            if (run.error_occurred) {
                m_timing.error = run.error_message;
            } else if (run.run_type == Run::RT_Iteration) {
                take(run);
            }
        }
    }

    const Timing& timing() const { return m_timing; }

private:
    // A body that does several operations in one iteration tells their number by SetItemsProcessed.
    void take(const Run& run) {
        const auto rate = run.counters.find("items_per_second");
        const bool hasRate = rate != run.counters.end() && rate->second.value > 0;
        m_timing.iterations = run.iterations;
        m_timing.nanoseconds =
            hasRate ? 1e9 / rate->second.value : run.real_accumulated_time * 1e9 / static_cast<double>(run.iterations);
    }

    Timing m_timing;
};

// Runs the body alone: until minSeconds have passed, or as often as told when iterations is not 0.
Timing runOnce(const Side& side, double minSeconds, benchmark::IterationCount iterations) {
    benchmark::ClearRegisteredBenchmarks();
    benchmark::internal::Benchmark* const run = benchmark::RegisterBenchmark(side.name, side.body)->UseRealTime();
    if (iterations > 0) {
        run->Iterations(iterations);
    } else {
        run->MinTime(minSeconds);
    }
    TimingReporter reporter;
    benchmark::RunSpecifiedBenchmarks(&reporter, nullptr, ".");
    return reporter.timing();
}

// One side with what it took in each round.
struct Contestant {
    Side side;
    benchmark::IterationCount iterations = 0;
    std::vector<double> nanoseconds;
};

std::vector<Contestant> contestantsOf(const Item& item) {
    std::vector<Contestant> result;
    result.push_back({item.ours, 0, {}});
    for (const Side& peer : item.peers) {
        result.push_back({peer, 0, {}});
    }
    if (item.limit.body != nullptr) {
        result.push_back({item.limit, 0, {}});
    }
    return result;
}

// Warms each side up and finds how often it runs in a round; the text of the first failure, or none.
std::string calibrate(std::vector<Contestant>& contestants, double minSeconds) {
    for (Contestant& contestant : contestants) {
        const Timing timing = runOnce(contestant.side, minSeconds, 0);
        if (!timing.error.empty() || timing.iterations == 0) {
            return std::string(contestant.side.name) + ": " + (timing.error.empty() ? "did not run" : timing.error);
        }
        contestant.iterations = timing.iterations;
    }
    return {};
}

Opponent compare(const Contestant& ours, const Contestant& theirs, double goal) {
    std::vector<double> ratios;
    for (std::size_t round = 0; round < ours.nanoseconds.size(); ++round) {
        ratios.push_back(ours.nanoseconds[round] / theirs.nanoseconds[round]);
    }
    return {theirs.side.name, median(theirs.nanoseconds), median(ratios), goal};
}

}  // namespace

double median(std::vector<double> values) {
    if (values.empty()) {
        return 0;
    }
    std::sort(values.begin(), values.end());
    const std::size_t middle = values.size() / 2;
    return values.size() % 2 != 0 ? values[middle] : (values[middle - 1] + values[middle]) / 2;
}

Row runItem(const Item& item, const RoundSettings& settings) {
    Row row;
    row.item = item.name;
    std::vector<Contestant> contestants = contestantsOf(item);
    row.error = calibrate(contestants, settings.minSeconds);
    if (!row.error.empty()) {
        return row;
    }
    for (int round = 0; round < settings.rounds; ++round) {
        for (Contestant& contestant : contestants) {
            contestant.nanoseconds.push_back(runOnce(contestant.side, 0, contestant.iterations).nanoseconds);
        }
    }
    const Contestant& ours = contestants.front();
    row.oursNanoseconds = median(ours.nanoseconds);
    for (std::size_t i = 1; i <= item.peers.size(); ++i) {
        const Opponent peer = compare(ours, contestants[i], item.peerGoal);
        if (!row.peer.isThere() || peer.nanoseconds < row.peer.nanoseconds) {
            row.peer = peer;
        }
    }
    if (item.limit.body != nullptr) {
        row.limit = compare(ours, contestants.back(), item.limitGoal);
    }
    return row;
}
