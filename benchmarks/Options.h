// The command line of tessal_bench.
#pragma once

#include <string>

#include "Rounds.h"

struct Options {
    RoundSettings rounds;
    std::string filter = ".*";  ///< a regular expression that some part of an item's name matches
    std::string csvFile;        ///< none: no file
    std::string reportFolder;   ///< none: no page and no picture
    bool isStrict = false;      ///< a missed goal is a failure
    bool isList = false;
    bool isHelp = false;
};

extern const char* const usage;

/// Reads the arguments; throws std::invalid_argument with the argument that is not understood.
Options readOptions(int count, char** arguments);
