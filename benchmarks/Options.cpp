#include "Options.h"

#include <cstdlib>
#include <stdexcept>

const char* const usage =
    "tessal_bench: times this library beside its peers and the machine's limits.\n"
    "\n"
    "  --filter REGEX      only items whose names match\n"
    "  --rounds N          rounds in which the sides of an item run in turn (5)\n"
    "  --min-time SECONDS  least time of one side in a round (0.05)\n"
    "  --csv FILE          writes the table there, too\n"
    "  --report FOLDER     writes benchmarks.md there, and pictures/benchmarks.svg below\n"
    "  --strict            exit status 1 when a goal is missed\n"
    "  --list              only the items' names\n";

namespace {

double readNumber(const std::string& option, const std::string& text, double least, double most) {
    char* end = nullptr;
    const double value = std::strtod(text.c_str(), &end);
    if (text.empty() || *end != '\0' || !(value >= least && value <= most)) {
        throw std::invalid_argument(option + " " + text);
    }
    return value;
}

void setValue(Options& options, const std::string& option, const std::string& value) {
    if (option == "--filter") {
        options.filter = value;
    } else if (option == "--csv") {
        options.csvFile = value;
    } else if (option == "--report") {
        options.reportFolder = value;
    } else if (option == "--rounds") {
        options.rounds.rounds = static_cast<int>(readNumber(option, value, 1, 1000));
    } else if (option == "--min-time") {
        options.rounds.minSeconds = readNumber(option, value, 0, 60);
    } else {
        throw std::invalid_argument(option);
    }
}

}  // namespace

Options readOptions(int count, char** arguments) {
    Options options;
    for (int i = 1; i < count; ++i) {
        const std::string option = arguments[i];
        if (option == "--strict") {
            options.isStrict = true;
        } else if (option == "--list") {
            options.isList = true;
        } else if (option == "--help" || option == "-h") {
            options.isHelp = true;
        } else if (i + 1 < count) {
            setValue(options, option, arguments[++i]);
        } else {
            throw std::invalid_argument(option);
        }
    }
    return options;
}
