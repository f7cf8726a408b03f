#include "Options.h"

#include <TessalUtility.h>

#include <vector>

namespace {

constexpr const char* program = "tessal_batch";

constexpr const char* format =
    "'Checks the lines of a batch script and carries them out. The exit status is 0 when all went well; 1 when lines "
    "were refused; 2 when the call is wrong or a file cannot be read; 130 after ^C.'"
    "{ <script=file> 'script to run; - reads standard input'"
    "  -i 'a prompt with help and completion'"
    "  --complete <line=text> 'print the words that can stand last in the line'"
    "  -h|--help 'print this text' }"
    "[--stop-on-error] 'end at the first line that is refused'"
    "[--data <directory=file>] 'where the data files are' "
    "[--host-root <directory=file>] 'what stands for / when the ports of a Linux host are looked for'";

Options::Task taskOf(const HkCmdArgs& args) {
    if (args.isGiven("-h")) {
        return Options::Task::ShowHelp;
    }
    if (args.isGiven("--complete")) {
        return Options::Task::Complete;
    }
    return args.isGiven("-i") ? Options::Task::Prompt : Options::Task::RunScript;
}

}  // namespace

Options readOptions(int argc, char** argv) {
    std::vector<const char*> words(argv, argv + argc);
    words.resize(words.empty() ? 1 : words.size());
    words[0] = program;
    const HkCmdArgs args(static_cast<int>(words.size()), words.data(), format, nullptr, 0);
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
    return options;
}

std::string optionsHelp() {
    return HkCmdArgs::help(program, format).c_str();
}
