#include "ProgressBar.h"

#include <TessalUtility.h>

#include <algorithm>
#include <chrono>
#include <cstdio>

#include "ProgressLine.h"

namespace {

using Clock = std::chrono::steady_clock;

/// The operation that is under way.
struct Operation {
    Progress progress;
    Clock::time_point began;
    std::uint64_t bytes = 0;  ///< of the whole operation
    int quarter = 0;          ///< the last one that was told
    int drawn = 0;            ///< columns of the line that the bar stands on
};

Operation operation;

bool isPreferred(TessalPreference::PREFERENCE preference, const char* value) {
    return HkStr::ICompare(TessalPreference::getPreferenceObject()->getPreference(preference), value) == 0;
}

/// Where the bar goes; without width where lines are wanted.
Terminal terminal() {
    const char* const noColour = HkEnv::GetEnv("NO_COLOR");
    const bool isPlain = (noColour != nullptr && noColour[0] != '\0') || isPreferred(TessalPreference::COLOUR, "Never");
    Terminal result = standardOutput();
    result.hasColours = (result.hasColours && !isPlain) || isPreferred(TessalPreference::COLOUR, "Always");
    result.width = isPreferred(TessalPreference::PROGRESS_STYLE, "Lines") ? 0 : result.width;
    return result;
}

/// A title must not move the cursor.
std::string printable(std::string text) {
    std::replace_if(
        text.begin(), text.end(), [](char c) { return static_cast<unsigned char>(c) < ' ' || c == '\x7f'; }, '?');
    return text;
}

int percentOf(const Callback& record) {
    const std::int64_t total = record.getTotalCount();
    const std::int64_t percent = total > 0 ? 100 * std::int64_t{record.getCurrentCount()} / total : 0;
    return static_cast<int>(std::clamp<std::int64_t>(percent, 0, 100));
}

void measure(const Callback& record) {
    Progress& progress = operation.progress;
    progress.title = printable(record.getCallbackText());
    progress.percent = percentOf(record);
    progress.seconds = std::chrono::duration<double>(Clock::now() - operation.began).count();
    progress.bytes = operation.bytes / 100 * static_cast<unsigned>(progress.percent) +
                     operation.bytes % 100 * static_cast<unsigned>(progress.percent) / 100;
}

void draw(const Terminal& terminal) {
    operation.drawn = terminal.width - 1;
    std::printf("\r%s", progressLine(operation.progress, terminal).c_str());
    std::fflush(stdout);
}

/// A line where a quarter has been completed, but for the last one, which is the end.
void tellQuarter() {
    const int quarter = operation.progress.percent / 25;
    if (quarter > operation.quarter && quarter < 4) {
        operation.quarter = quarter;
        std::printf("%s\n", plainLine(operation.progress).c_str());
        std::fflush(stdout);
    }
}

void close(const Terminal& terminal) {
    ProgressBar::makeRoom();
    const auto isDone = terminal.width > 0 ? closingLine : plainLine;
    const auto line = operation.progress.percent < 100 ? stoppedLine : isDone;
    std::printf("%s\n", line(operation.progress).c_str());
    std::fflush(stdout);
    operation.bytes = 0;
}

bool show(Callback& record) {
    if (record.getProgressStatus() == PROGRESS_START) {
        operation.began = Clock::now();
        operation.quarter = 0;
    }
    if (isPreferred(TessalPreference::PROGRESS_STYLE, "None")) {
        return true;
    }
    measure(record);
    const Terminal output = terminal();
    if (record.getProgressStatus() == PROGRESS_END) {
        close(output);
    } else if (output.width > 0) {
        draw(output);
    } else {
        tellQuarter();
    }
    return true;
}

}  // namespace

void ProgressBar::install() {
    ProgressInterfaceClass::setCallbackFunction(show);
}

void ProgressBar::expectBytes(std::uint64_t total) {
    operation.bytes = total;
}

void ProgressBar::makeRoom() {
    if (operation.drawn > 0) {
        std::printf("\r%*s\r", operation.drawn, "");
        std::fflush(stdout);
        operation.drawn = 0;
    }
}
