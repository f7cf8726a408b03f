// The prompt's progress function.
#pragma once

#include <cstdint>

/// Shows on standard output how far the library's operations are: a terminal has a bar on one line, which a closing
/// line replaces at the end; any other output gets a line at each quarter. There is colour on a terminal unless the
/// environment variable NO_COLOR is set. The preferences ProgressStyle and Colour choose less.
class ProgressBar {
public:
    ProgressBar() = delete;

    /// Registers the function with the library, for the rest of the process.
    static void install();

    /// The bytes of the operation that begins next, from which it gets a rate.
    static void expectBytes(std::uint64_t total);

    /// Takes the bar off its line, so that a message can stand there; the next step draws it anew.
    static void makeRoom();
};
