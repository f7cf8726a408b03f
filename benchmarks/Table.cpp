#include "Table.h"

#include <algorithm>
#include <array>
#include <fstream>
#include <thread>

namespace {

// The processor's name where the host tells it.
std::string processorName() {
    std::ifstream info("/proc/cpuinfo");
    for (std::string line; std::getline(info, line);) {
        const std::size_t colon = line.find(": ");
        if (line.compare(0, 10, "model name") == 0 && colon != std::string::npos) {
            return line.substr(colon + 2);
        }
    }
    return "unknown processor";
}

// A goal that is not asked, or a side that is not there, leaves its columns as "-".
std::string number(const char* format, double value, bool isThere) {
    return isThere ? formatted(format, value) : "-";
}

// Three digits or more: whole nanoseconds only where they are many.
std::string nanoseconds(double value, bool isThere) {
    return number(value < 1000 ? "%.2f" : "%.0f", value, isThere);
}

const char* verdict(const Row& row) {
    if (!row.error.empty()) {
        return "error";
    }
    if (!row.isAsked()) {
        return "-";
    }
    return row.isMet() ? "met" : "missed";
}

// Widths of the columns behind the item's name; a negative one starts at the left. Longer names are cut.
constexpr std::array<int, 10> widths = {12, -28, 12, 7, 6, -28, 12, 7, 6, -6};

std::string lineOf(const std::vector<std::string>& columns, std::size_t itemWidth) {
    std::string line = formatted("%-*s", static_cast<int>(itemWidth), columns[0].c_str());
    for (std::size_t i = 0; i < widths.size(); ++i) {
        line += formatted(i == 1 || i == 5 || i == 9 ? "  %*.28s" : " %*.28s", widths[i], columns[i + 1].c_str());
    }
    line.erase(line.find_last_not_of(' ') + 1);
    return line + "\n";
}

void addOpponent(std::vector<std::string>& columns, const Opponent& opponent) {
    columns.push_back(opponent.isThere() ? opponent.name : "-");
    columns.push_back(nanoseconds(opponent.nanoseconds, opponent.isThere()));
    columns.push_back(number("%.2f", opponent.ratio, opponent.isThere()));
    columns.push_back(number("%.2f", opponent.goal, opponent.isThere() && opponent.goal > 0));
}

std::string quoted(const std::string& text) {
    std::string result = "\"";
    for (const char ch : text) {
        result += ch;
        if (ch == '"') {
            result += ch;
        }
    }
    return result + "\"";
}

std::string csvOpponent(const Opponent& opponent) {
    if (!opponent.isThere()) {
        return ",,,,";
    }
    return formatted(",%s,%.4g,%.4g,", quoted(opponent.name).c_str(), opponent.nanoseconds, opponent.ratio) +
           (opponent.goal > 0 ? formatted("%.4g", opponent.goal) : "");
}

}  // namespace

std::string escaped(const std::string& text) {
    std::string result;
    for (const char ch : text) {
        const char* const entity = ch == '<' ? "&lt;" : ch == '>' ? "&gt;" : ch == '&' ? "&amp;" : nullptr;
        result += entity != nullptr ? entity : std::string(1, ch);
    }
    return result;
}

std::string describeMachine() {
    return processorName() + ", " + std::to_string(std::thread::hardware_concurrency()) + " threads; " +
           TESSAL_BENCH_SYSTEM + "; " + TESSAL_BENCH_COMPILER + "; " + TESSAL_BENCH_BUILD_TYPE;
}

std::string summary(const std::vector<Row>& rows) {
    const auto failed = std::count_if(rows.begin(), rows.end(), [](const Row& row) { return !row.error.empty(); });
    const auto missed = std::count_if(rows.begin(), rows.end(), [](const Row& row) { return !row.isMet(); });
    return formatted("%zu items, %td with an error, %td with a missed goal", rows.size(), failed, missed);
}

std::vector<std::string> cells(const Row& row) {
    std::vector<std::string> columns = {row.item, nanoseconds(row.oursNanoseconds, row.error.empty())};
    addOpponent(columns, row.peer);
    addOpponent(columns, row.limit);
    columns.emplace_back(verdict(row));
    return columns;
}

std::string textHeading(std::size_t itemWidth) {
    return lineOf({"item", "ours ns", "fastest peer", "ns", "ratio", "goal", "limit", "ns", "ratio", "goal", "goals"},
                  itemWidth);
}

std::string textRow(const Row& row, std::size_t itemWidth) {
    if (!row.error.empty()) {
        return formatted("%-*s error: ", static_cast<int>(itemWidth), row.item.c_str()) + row.error + "\n";
    }
    return lineOf(cells(row), itemWidth);
}

std::string csv(const std::vector<Row>& rows) {
    std::string result = "item,ours_ns,peer,peer_ns,peer_ratio,peer_goal,limit,limit_ns,limit_ratio,limit_goal,goals\n";
    for (const Row& row : rows) {
        result += quoted(row.item) + formatted(",%.4g", row.oursNanoseconds) + csvOpponent(row.peer) +
                  csvOpponent(row.limit) + "," + verdict(row) + "\n";
    }
    return result;
}
