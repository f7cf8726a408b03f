// The batch prompt: runs the lines of a script, of standard input, or of a person.

#include <TessalUtility.h>

#include <cstdio>
#include <exception>
#include <filesystem>
#include <fstream>
#include <iostream>

#include "Completion.h"
#include "LineSource.h"
#include "Messages.h"
#include "Options.h"
#include "Session.h"

namespace {

enum Status { AllFine = 0, LinesRefused = 1, CannotRun = 2 };

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

Status summarise(const Session& session, int lines) {
    using Outcome = Session::Outcome;
    std::printf("%d lines: %d commands checked, %d refused as expected, %d refused\n", lines,
                session.count(Outcome::Done), session.count(Outcome::RefusedAsExpected),
                session.count(Outcome::Refused));
    return session.count(Outcome::Refused) == 0 ? AllFine : LinesRefused;
}

Status runLines(std::istream& stream, const std::string& name, bool stopOnError) {
    Messages messages(name);
    Session session(messages, false);
    LineSource source(stream);
    std::string line;
    while (!session.hasEnded() && source.next(line)) {
        if (session.take(line, source.number()) == Session::Outcome::Refused && stopOnError) {
            break;
        }
    }
    if (source.hasFailed()) {
        messages.sayOfAll("cannot be read");
        return CannotRun;
    }
    return summarise(session, source.number());
}

Status runScript(const Options& options) {
    if (options.script == "-") {
        return runLines(std::cin, "standard input", options.stopOnError);
    }
    std::ifstream file(options.script, std::ios::binary);
    if (!file) {
        std::fprintf(stderr, "%s: cannot be opened\n", options.script.c_str());
        return CannotRun;
    }
    return runLines(file, options.script, options.stopOnError);
}

bool askForLine(LineSource& source, std::string& line) {
    std::fputs("tessal> ", stdout);
    std::fflush(stdout);
    return source.next(line);
}

/// A person has seen each message, so lines that were refused do not count at the end.
Status runPrompt(bool stopOnError) {
    std::puts("help lists the commands, quit ends, a tab before Enter shows how the line can go on.");
    Messages messages("");
    Session session(messages, true);
    LineSource source(std::cin);
    std::string line;
    while (!session.hasEnded() && askForLine(source, line)) {
        std::string asked;
        if (isCompletionQuery(line, asked)) {
            std::fputs(completionsOf(asked).c_str(), stdout);
        } else if (session.take(line, source.number()) == Session::Outcome::Refused && stopOnError) {
            return LinesRefused;
        }
    }
    if (!session.hasEnded()) {
        std::puts("");
    }
    return AllFine;
}

Status perform(const Options& options) {
    switch (options.task) {
        case Options::Task::Complete:
            std::fputs(completionsOf(options.line).c_str(), stdout);
            return AllFine;
        case Options::Task::Prompt:
            return runPrompt(options.stopOnError);
        default:
            return runScript(options);
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
