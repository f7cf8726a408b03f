// The batch prompt: runs the lines of a script, of standard input, or of a person.

#include <TessalUtility.h>

#include <cstdio>
#include <exception>
#include <filesystem>

#include "Completion.h"
#include "Interruption.h"
#include "Options.h"
#include "ProgressBar.h"
#include "Runner.h"

namespace {

/// Data files are taken from the directory given, or from the environment's; without both, from the source tree that
/// the program was built in, as long as that is there, and then from where the library looks by itself.
void chooseData(const std::string& directories) {
    if (!directories.empty()) {
        DeviceProfile::setDataPath(directories.c_str());
    } else if (HkEnv::GetEnv("TESSAL_DATA_PATH") == nullptr && std::filesystem::exists(TESSAL_SOURCE_DATA)) {
        DeviceProfile::setDataPath(TESSAL_SOURCE_DATA);
    }
}

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
    chooseData(options.dataPath);
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
