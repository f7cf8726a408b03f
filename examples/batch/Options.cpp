#include "Options.h"

#include <TessalUtility.h>

#include <algorithm>
#include <cstdio>
#include <iterator>

namespace {

constexpr const char* program = "tessal_batch";
constexpr const char* commandSwitch = "-c";
/// How the completion of a shell calls, so it is not in the help.
constexpr const char* completeWords = "--complete-words";

constexpr const char* format =
    "'Checks the lines of a batch script and carries them out. The exit status is 0 when all went well; 1 when lines "
    "were refused; 2 when the call is wrong or a file cannot be read; 130 after ^C.'"
    "{ <script=file> 'script to run; - reads standard input'"
    "  -i 'a prompt with help and completion'"
    "  -c 'run the one command that all words behind this one make'"
    "  --complete <line=text> 'print the words that can stand last in the line'"
    "  -h|--help 'print this text' }"
    "[--stop-on-error] 'end at the first line that is refused'"
    "[--data <directory=file>] 'where the data files are' "
    "[--host-root <directory=file>] 'what stands for / when the ports of a Linux host are looked for'";

struct Row {
    const char* option;
    Options::Task task;
};

constexpr Row rows[] = {
    {"-h", Options::Task::ShowHelp},
    {"--complete", Options::Task::Complete},
    {"-i", Options::Task::Prompt},
    {commandSwitch, Options::Task::RunCommand},
};

Options::Task taskOf(const HkCmdArgs& args) {
    for (const Row& row : rows) {
        if (args.isGiven(row.option)) {
            return row.task;
        }
    }
    return Options::Task::RunScript;
}

/// What a shell asks about; the data files are taken from where the call to come will have them.
Options completionOf(const std::vector<std::string>& words) {
    Options options;
    options.task = Options::Task::CompleteWords;
    options.words.assign(words.begin() + 1, words.end());
    const auto data = std::find(words.begin(), words.end(), "--data");
    if (data != words.end() && data + 1 != words.end()) {
        options.dataPath = data[1];
    }
    return options;
}

}  // namespace

Options readOptions(int argc, char** argv) {
    std::vector<std::string> words(argv + std::min(argc, 1), argv + argc);
    if (!words.empty() && words[0] == completeWords) {
        return completionOf(words);
    }
    const std::size_t own = std::min(placeOfCommand(words) + 1, words.size());
    std::vector<const char*> ownWords = {program};
    std::transform(words.begin(), words.begin() + static_cast<std::ptrdiff_t>(own), std::back_inserter(ownWords),
                   [](const std::string& word) { return word.c_str(); });
    const HkCmdArgs args(static_cast<int>(ownWords.size()), ownWords.data(), format, nullptr, 0);
    Options options;
    if (args.iserror() != 0) {
        return options;
    }
    options.task = taskOf(args);
    options.script = args.text("script", 0, "");
    options.line = args.text("--complete", 0, "");
    options.dataPath = args.text("--data", 0, "");
    options.hostRoot = args.text("--host-root", 0, "");
    options.stopOnError = args.isGiven("--stop-on-error");
    options.words.assign(words.begin() + static_cast<std::ptrdiff_t>(own), words.end());
    if (options.task == Options::Task::RunCommand && options.words.empty()) {
        std::fprintf(stderr, "%s: %s needs a command behind it\n", program, commandSwitch);
        options.task = Options::Task::Refuse;
    }
    return options;
}

std::string optionsHelp() {
    return HkCmdArgs::help(program, format).c_str();
}

const char* optionsFormat() {
    return format;
}

std::size_t placeOfCommand(const std::vector<std::string>& words) {
    return static_cast<std::size_t>(std::find(words.begin(), words.end(), commandSwitch) - words.begin());
}
