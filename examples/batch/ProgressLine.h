// How far an operation is, as text.
#pragma once

#include <cstdint>
#include <string>

#include "Terminal.h"

struct Progress {
    std::string title;
    int percent = 0;
    double seconds = 0;       ///< since it began
    std::uint64_t bytes = 0;  ///< done so far; 0 where it is not counted in bytes
};

/// One line for a terminal, without a line end and always of one column less than the terminal has: title, bar,
/// percent, rate and the time left. In a narrow one the bar and then the rest give way.
std::string progressLine(const Progress& progress, const Terminal& terminal);

/// The line for an output that keeps all it gets.
std::string plainLine(const Progress& progress);

/// The line that stays on a terminal when the operation is done.
std::string closingLine(const Progress& progress);

/// The line that stays when it was ended before all was done.
std::string stoppedLine(const Progress& progress);
