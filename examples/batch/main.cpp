// The batch prompt: runs the lines of a script, of standard input, or of a person.

#include <TessalUtility.h>

#include <cstdio>
#include <exception>

#include "Completion.h"
#include "Interruption.h"
#include "Options.h"
#include "ProgressBar.h"
#include "Runner.h"

namespace {

bool loadCommands() {
    try {
        TessalCmdargs::createCommandMap();
    } catch (TessalException& exception) {
        exception.report();
        return false;
    }
    if (TessalCmdargs::findAllCommands().empty()) {
        std::fputs("tessal_batch: there are no commands; --data DIR says where tessal.acd is\n", stderr);
        return false;
    }
    return true;
}

Status perform(const Options& options) {
    switch (options.task) {
        case Options::Task::Complete:
            std::fputs(completionsOf(options.line).c_str(), stdout);
            return AllFine;
        case Options::Task::CompleteWords:
            std::fputs(completionsOf(options.words).c_str(), stdout);
            return AllFine;
        case Options::Task::RunCommand:
            return runCommand(options.words);
        case Options::Task::Prompt:
            return runPrompt(options.stopOnError);
        default:
            return runScript(options.script, options.stopOnError);
    }
}

Status run(int argc, char** argv) {
    const Options options = readOptions(argc, argv);
    if (options.task == Options::Task::Refuse) {
        return CannotRun;
    }
    if (options.task == Options::Task::ShowHelp) {
        std::fputs(optionsHelp().c_str(), stdout);
        return AllFine;
    }
    if (!options.dataPath.empty()) {
        DeviceProfile::setDataPath(options.dataPath.c_str());
    }
    CPortResources::setHostRoot(options.hostRoot.empty() ? nullptr : options.hostRoot.c_str());
    ProgressBar::install();
    Interruption::arm();
    return loadCommands() ? perform(options) : CannotRun;
}

}  // namespace

int main(int argc, char** argv) {
    try {
        return run(argc, argv);
    } catch (const std::exception& exception) {
        std::fprintf(stderr, "tessal_batch: %s\n", exception.what());
        return CannotRun;
    }
}
