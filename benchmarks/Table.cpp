#include "Table.h"

#include <cstdio>
#include <fstream>
#include <thread>

namespace {

template <class... Values>
std::string formatted(const char* format, Values... values) {
    char text[512];
    std::snprintf(text, sizeof text, format, values...);
    return text;
}

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

constexpr const char* rowFormat = "%-*s %12s  %-28.28s %12s %7s %6s  %-28.28s %12s %7s %6s  %s\n";

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

std::string describeMachine() {
    return processorName() + ", " + std::to_string(std::thread::hardware_concurrency()) + " threads; " +
           TESSAL_BENCH_COMPILER + "; " + TESSAL_BENCH_BUILD_TYPE;
}

std::string textHeading(std::size_t itemWidth) {
    return formatted(rowFormat, static_cast<int>(itemWidth), "item", "ours ns", "fastest peer", "ns", "ratio", "goal",
                     "limit", "ns", "ratio", "goal", "goals");
}

std::string textRow(const Row& row, std::size_t itemWidth) {
    if (!row.error.empty()) {
        return formatted("%-*s error: ", static_cast<int>(itemWidth), row.item.c_str()) + row.error + "\n";
    }
    const Opponent& peer = row.peer;
    const Opponent& limit = row.limit;
    return formatted(
        rowFormat, static_cast<int>(itemWidth), row.item.c_str(), nanoseconds(row.oursNanoseconds, true).c_str(),
        peer.isThere() ? peer.name.c_str() : "-", nanoseconds(peer.nanoseconds, peer.isThere()).c_str(),
        number("%.2f", peer.ratio, peer.isThere()).c_str(),
        number("%.2f", peer.goal, peer.isThere() && peer.goal > 0).c_str(), limit.isThere() ? limit.name.c_str() : "-",
        nanoseconds(limit.nanoseconds, limit.isThere()).c_str(), number("%.2f", limit.ratio, limit.isThere()).c_str(),
        number("%.2f", limit.goal, limit.isThere() && limit.goal > 0).c_str(), verdict(row));
}

std::string csv(const std::vector<Row>& rows) {
    std::string result = "item,ours_ns,peer,peer_ns,peer_ratio,peer_goal,limit,limit_ns,limit_ratio,limit_goal,goals\n";
    for (const Row& row : rows) {
        result += quoted(row.item) + formatted(",%.4g", row.oursNanoseconds) + csvOpponent(row.peer) +
                  csvOpponent(row.limit) + "," + verdict(row) + "\n";
    }
    return result;
}
