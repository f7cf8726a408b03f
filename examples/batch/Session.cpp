#include "Session.h"

#include <cstdio>
#include <memory>
#include <vector>

#include "Echo.h"
#include "Handlers.h"
#include "Quoting.h"

Session::Outcome Session::take(const std::string& line, int number) {
    m_messages.setLine(number);
    m_number = number;
    const bool isFaulty = !line.empty() && line[0] == '!';
    Outcome outcome = takeText(isFaulty ? line.substr(1) : line);
    if (isFaulty && outcome == Outcome::Refused) {
        outcome = Outcome::RefusedAsExpected;
    } else if (isFaulty) {
        m_messages.say("this line should have been refused");
        outcome = Outcome::Refused;
    }
    ++m_counts[static_cast<std::size_t>(outcome)];
    return outcome;
}

Session::Outcome Session::takeText(const std::string& text) {
    if (text.find('\0') != std::string::npos) {
        m_messages.say("the line holds a zero byte");
        return Outcome::Refused;
    }
    try {
        const std::unique_ptr<CommandSet> commands(CommandSet::string2CommandSet(text.c_str()));
        if (commands == nullptr) {
            return Outcome::Nothing;
        }
        return runCommand(*commands) ? Outcome::Done : Outcome::Refused;
    } catch (const LogicException&) {
        return Outcome::Refused;  // the reason has been reported
    }
}

bool Session::runCommand(CommandSet& commands) {
    m_tokens = &commands;
    HkString name(commands.getCommand(0));
    name.MakeLower();
    const char* const format = TessalCmdargs::findBatchFormatString(name);
    if (format[0] == '\0') {
        sayUnknown(commands.getCommand(0));
        return false;
    }
    if (!commands.decrementPositions()) {
        return false;
    }
    const std::unique_ptr<HkCmdArgs> args(
        TessalCmdargs::getCmdargs(commands.getNumberCommands(), commands.getCommands(), true));
    const Handler handler = findHandler(name);
    if (!m_isPrompt || handler == nullptr) {
        show(echoOf(*args, format));
    }
    return handler == nullptr || handler(*this, *args);
}

void Session::show(const std::string& echo) const {
    if (!m_isPrompt) {
        std::printf("%5d  ", m_number);
    }
    std::fputs(echo.c_str(), stdout);
}

void Session::leaveCable() {
    m_port.giveBack();
    m_device.clear();
}

void Session::sayUnknown(const char* word) const {
    const std::vector<HkString> known = TessalCmdargs::findAllCommands();
    const char* const nearest = HkCmdArgs::nearest(word, known);
    const std::string text = "unknown command " + quoted(word);
    m_messages.say(nearest != nullptr ? text + "; did you mean " + nearest + "?" : text);
}
