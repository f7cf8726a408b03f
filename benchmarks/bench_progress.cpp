// One step of an operation of many steps, against the same filter on the processor-time clock and one clock reading.

#include <chrono>
#include <ctime>

#include "ProgressInterfaceClass.h"
#include "benchmarks/Item.h"

namespace {

constexpr int steps = 1 << 20;

bool ignore(Callback&) {
    return true;
}

void stepOurs(benchmark::State& state) {
    ProgressInterfaceClass::setCallbackFunction(ignore);
    ProgressInterfaceClass::startProgressUpdate(steps, "bench");
    for (auto _ : state) {
        ProgressInterfaceClass::updateProgress();
        if (ProgressInterfaceClass::m_cbData->getCurrentCount() == steps) {
            ProgressInterfaceClass::m_cbData->setCurrentCount(0);
        }
    }
}

void stepOnProcessorClock(benchmark::State& state) {
    int current = 0;
    int lastPercent = -1;
    std::clock_t last = std::clock();
    for (auto _ : state) {
        current = current == steps ? 0 : current + 1;
        const std::clock_t now = std::clock();
        const int percent = static_cast<int>(static_cast<unsigned int>(current) * 100U) / steps;
        if ((now - last) / CLOCKS_PER_SEC > 10 || percent == lastPercent) {
            last = now;
        } else {
            lastPercent = percent;
        }
        benchmark::DoNotOptimize(lastPercent);
    }
}

void readClock(benchmark::State& state) {
    for (auto _ : state) {
        benchmark::DoNotOptimize(std::chrono::steady_clock::now());
    }
}

const RegisterItem stepItem{{"progress_step",
                             {"ProgressInterfaceClass", stepOurs},
                             {{"filter on clock()", stepOnProcessorClock}},
                             {"steady clock read", readClock},
                             0.05,
                             1.25}};

}  // namespace
