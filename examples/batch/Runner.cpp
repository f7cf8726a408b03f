#include "Runner.h"

#include <cstdio>
#include <fstream>
#include <iostream>

#include "Completion.h"
#include "Interruption.h"
#include "LineSource.h"
#include "Messages.h"
#include "OptionCommands.h"
#include "Session.h"

namespace {

Status summarise(const Session& session, int lines) {
    using Outcome = Session::Outcome;
    std::printf("%d lines: %d checked, %d refused as expected, %d refused\n", lines, session.count(Outcome::Done),
                session.count(Outcome::RefusedAsExpected), session.count(Outcome::Refused));
    return session.count(Outcome::Refused) == 0 ? AllFine : LinesRefused;
}

bool goesOn(const Session& session) {
    return !session.hasEnded() && !Interruption::isWanted();
}

bool endsRun(Session::Outcome outcome, bool stopOnError) {
    return outcome == Session::Outcome::Refused && (stopOnError || isPreferred(TessalPreference::STOP_ON_ERROR));
}

Status runLines(std::istream& stream, const std::string& name, bool stopOnError) {
    Messages messages(name);
    Session session(messages, false);
    LineSource source(stream);
    std::string line;
    while (goesOn(session) && source.next(line)) {
        if (endsRun(session.take(line, source.number()), stopOnError)) {
            break;
        }
    }
    if (Interruption::isWanted()) {
        messages.sayOfAll("interrupted");
        return Interrupted;
    }
    if (source.hasFailed()) {
        messages.sayOfAll("cannot be read");
        return CannotRun;
    }
    return summarise(session, source.number());
}

bool askForLine(LineSource& source, std::string& line) {
    std::fputs("tessal> ", stdout);
    std::fflush(stdout);
    return source.next(line);
}

}  // namespace

Status runScript(const std::string& script, bool stopOnError) {
    if (script == "-") {
        return runLines(std::cin, "standard input", stopOnError);
    }
    std::ifstream file(script, std::ios::binary);
    if (!file) {
        std::fprintf(stderr, "%s: cannot be read\n", script.c_str());
        return CannotRun;
    }
    return runLines(file, script, stopOnError);
}

Status runCommand(const std::vector<std::string>& words) {
    Messages messages("");
    Session session(messages, true);
    std::string line;
    for (const std::string& word : words) {
        const bool isPlain = !word.empty() && word.find_first_of(" \t") == std::string::npos;
        line += (isPlain ? word : "\"" + word + "\"") + " ";
    }
    return session.take(line, 1) == Session::Outcome::Done ? AllFine : LinesRefused;
}

Status runPrompt(bool stopOnError) {
    std::puts("help lists the commands, quit ends, a tab before Enter shows how the line can go on.");
    Messages messages("");
    Session session(messages, true);
    LineSource source(std::cin);
    std::string line;
    while (goesOn(session) && askForLine(source, line)) {
        std::string asked;
        if (isCompletionQuery(line, asked)) {
            std::fputs(completionsOf(asked).c_str(), stdout);
        } else if (endsRun(session.take(line, source.number()), stopOnError)) {
            return LinesRefused;
        }
    }
    if (!session.hasEnded()) {
        std::puts("");
    }
    return Interruption::isWanted() ? Interrupted : AllFine;
}
