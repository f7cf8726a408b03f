#include "Report.h"

#include <ctime>

#include "Peers.h"
#include "Table.h"

namespace {

constexpr const char* introduction = R"(# Benchmarks

Each row is one operation: this library beside the fastest peer that is installed and beside the limit of the machine,
the least work that the result needs, such as copying its bytes. The sides run in turn, round after round, in one
process; a ratio is the median over the rounds of ours / theirs in the same round, so 0.50 means half the time. Times
are medians in nanoseconds. Both sides' results are compared before the clock starts. Rows below a nanosecond change by a
quarter with the place that the linker gives their loops.

This command runs all rows, and writes this page and its picture anew:

<!-- suite: bench -->
```sh
cmake --preset release && cmake --build --preset release --target bench_report
```

)";

constexpr const char* picture = R"(
![Ratios of all items on a logarithmic scale, with their goals](pictures/benchmarks.svg)

| item | ours | fastest peer | ns | ratio | goal | limit | ns | ratio | goal | goals |
|---|---:|---|---:|---:|---:|---|---:|---:|---:|---|
)";

std::string today() {
    const std::time_t now = std::time(nullptr);
    char text[16] = "";
    std::strftime(text, sizeof text, "%Y-%m-%d", std::gmtime(&now));
    return text;
}

std::string run(const std::vector<Row>& rows, const RoundSettings& settings) {
    return "- On: " + describeMachine() + "\n- Peers: " + describePeers() + "\n- When and how long: " + today() + ", " +
           std::to_string(settings.rounds) + " rounds\n- Result: " + summary(rows) + "\n";
}

}  // namespace

std::string page(const std::vector<Row>& rows, const RoundSettings& settings) {
    std::string text = introduction + run(rows, settings) + picture;
    for (const Row& row : rows) {
        text += "|";
        for (const std::string& cell : cells(row)) {
            text += " " + escaped(cell) + " |";
        }
        text += "\n";
    }
    return text;
}
