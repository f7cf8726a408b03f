// A debug line that nobody hears, beside putting the same line together.
#include <cstdio>

#include "Item.h"

#include "HkMessageManager.h"

namespace {

constexpr const char* format = "Waiting for semaphore %s, port id %d, count %d\n";

void unheardLine(benchmark::State& state) {
    const char* name = "CableSharing12";
    int number = 12;
    if (HkMessageManager::isDebugHeard()) {
        state.SkipWithError("debug lines are heard: unset ZRX_TESSAL_TRACE_FLAG");
    }
    for (auto _ : state) {
        benchmark::DoNotOptimize(name);
        benchmark::DoNotOptimize(number);
        HkMessageManager::debugStub(format, name, number, 1);
    }
}

void formattedLine(benchmark::State& state) {
    const char* name = "CableSharing12";
    int number = 12;
    char line[128];
    for (auto _ : state) {
        benchmark::DoNotOptimize(name);
        benchmark::DoNotOptimize(number);
        std::snprintf(line, sizeof line, format, name, number, 1);
        benchmark::DoNotOptimize(line);
    }
}

const RegisterItem item{{"debug_line_unheard", {"debugStub", unheardLine}, {{"snprintf", formattedLine}}, {}, 0.06, 0}};

}  // namespace
