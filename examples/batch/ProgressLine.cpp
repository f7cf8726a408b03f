#include "ProgressLine.h"

#include <algorithm>
#include <cmath>
#include <cstdio>
#include <iterator>

namespace {

constexpr std::size_t margin = 2;

template <class... Values>
std::string formatted(const char* format, Values... values) {
    char text[64];
    std::snprintf(text, sizeof text, format, values...);
    return text;
}

std::string sizeText(double bytes) {
    const char* const units[] = {"B", "KiB", "MiB", "GiB"};
    std::size_t unit = 0;
    while (bytes >= 1024 && unit + 1 < std::size(units)) {
        bytes /= 1024;
        ++unit;
    }
    return formatted(unit == 0 ? "%.0f %s" : "%.1f %s", bytes, units[unit]);
}

std::string rateText(const Progress& progress) {
    return progress.bytes == 0 || progress.seconds <= 0
               ? ""
               : sizeText(static_cast<double>(progress.bytes) / progress.seconds) + "/s";
}

std::string clockText(double seconds) {
    constexpr double longest = 359999;  // 99:59:59
    const int whole = static_cast<int>(std::lround(std::min(seconds, longest)));
    return whole < 3600 ? formatted("%d:%02d", whole / 60, whole % 60)
                        : formatted("%d:%02d:%02d", whole / 3600, whole / 60 % 60, whole % 60);
}

std::string timeLeft(const Progress& progress) {
    const double left = progress.percent == 0 ? 0 : progress.seconds * (100 - progress.percent) / progress.percent;
    return progress.percent == 0 ? "" : clockText(left) + " left";
}

/// The columns of UTF-8 text, one for each character.
std::size_t columns(const std::string& text) {
    return static_cast<std::size_t>(std::count_if(
        text.begin(), text.end(), [](char c) { return (static_cast<unsigned char>(c) & 0xC0U) != 0x80U; }));
}

/// What fits into the columns, no character cut in two.
std::string shortened(std::string text, std::size_t limit) {
    while (columns(text) > limit) {
        text.pop_back();
    }
    return text;
}

std::string bar(int percent, std::size_t width, bool isColoured) {
    const std::size_t filled = width * static_cast<std::size_t>(percent) / 100;
    const std::string done(filled, '#');
    return '[' + (isColoured ? "\x1b[32m" + done + "\x1b[0m" : done) + std::string(width - filled, '-') + ']';
}

}  // namespace

std::string progressLine(const Progress& progress, const Terminal& terminal) {
    constexpr std::size_t shortestBar = 10;
    const auto width = static_cast<std::size_t>(std::max(terminal.width - 1, 1));
    const std::string title = std::string(margin, ' ') + shortened(progress.title, std::max(width / 3, shortestBar));
    const std::string figures =
        formatted("  %3d %%  %11s  %12s", progress.percent, rateText(progress).c_str(), timeLeft(progress).c_str());
    const std::size_t taken = columns(title) + figures.size() + 4;  // two blanks before the bar, and its brackets
    if (taken + shortestBar <= width) {
        return title + "  " + bar(progress.percent, width - taken, terminal.hasColours) + figures;
    }
    const std::string rest = shortened(title + figures, width);
    return rest + std::string(width - columns(rest), ' ');
}

std::string closingLine(const Progress& progress) {
    const std::string rate = rateText(progress);
    return std::string(margin, ' ') + progress.title + ": " +
           (rate.empty() ? "done" : sizeText(static_cast<double>(progress.bytes))) +
           formatted(" in %.1f s", progress.seconds) + (rate.empty() ? "" : ", " + rate);
}

std::string plainLine(const Progress& progress) {
    return std::string(margin, ' ') + progress.title + formatted(": %d %%", progress.percent);
}

std::string stoppedLine(const Progress& progress) {
    return std::string(margin, ' ') + progress.title + formatted(": stopped at %d %%", progress.percent);
}
