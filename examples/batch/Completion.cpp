#include "Completion.h"

#include <TessalUtility.h>

#include <memory>

#include "Options.h"

namespace {

constexpr const char* blanks = " \t";
constexpr const char* queryWord = "complete";

bool endsInBlank(const std::string& line) {
    return line.empty() || std::string(blanks).find(line.back()) != std::string::npos;
}

/// The tokens of the line, the last one being the word to complete, which may be empty.
CommandSet wordsOf(const std::string& line) {
    const std::unique_ptr<CommandSet> split(CommandSet::string2CommandSet(line.c_str()));
    CommandSet words = split != nullptr ? *split : CommandSet();
    if (endsInBlank(line) || words.getNumberCommands() == 0) {
        words.addCommand("");
    }
    return words;
}

const char* formatOf(CommandSet& words) {
    HkString command(words.getCommand(0));
    command.MakeLower();
    return TessalCmdargs::findBatchFormatString(command);
}

std::vector<HkString> candidatesFor(CommandSet& words) {
    if (words.getNumberCommands() == 1) {
        return TessalCmdargs::findMatchingCommands(words.getCommand(0));
    }
    return HkCmdArgs::complete(words.getNumberCommands(), words.getCommands(), formatOf(words));
}

/// What a format says about one of its switches or words; empty for what is none, such as a value.
std::string helpOn(const HkString& word, const char* format) {
    for (const HkCmdArgInfo& argument : HkCmdArgs::describe(format)) {
        for (const HkString& name : argument.names) {
            if (name == word) {
                return argument.help.c_str();
            }
        }
    }
    return {};
}

std::string commandsWithHelp(CommandSet& words) {
    const bool isFirst = words.getNumberCommands() == 1;
    std::string text;
    for (const HkString& candidate : candidatesFor(words)) {
        const std::string help = isFirst
                                     ? HkCmdArgs::description(TessalCmdargs::findBatchFormatString(candidate)).c_str()
                                     : helpOn(candidate, formatOf(words));
        text += std::string(candidate) + "\t" + help + "\n";
    }
    return text;
}

std::string ownOptionsWithHelp(CommandSet& words) {
    const bool isOption = words.getCommand(words.getNumberCommands() - 1)[0] == '-';
    std::string text;
    for (const HkString& option :
         HkCmdArgs::complete(words.getNumberCommands(), words.getCommands(), optionsFormat())) {
        if (isOption) {
            text += std::string(option) + "\t" + helpOn(option, optionsFormat()) + "\n";
        }
    }
    return text;
}

}  // namespace

std::string completionsOf(const std::string& line) {
    std::string text;
    try {
        CommandSet words = wordsOf(line);
        for (const HkString& candidate : candidatesFor(words)) {
            text += std::string(candidate) + "\n";
        }
    } catch (const DataMismatchException&) {
        // Inside a quotation nothing can be known.
    }
    return text;
}

std::string completionsOf(const std::vector<std::string>& words) {
    const std::size_t command = placeOfCommand(words) + 1;
    const bool isCommand = command < words.size();
    CommandSet typed;
    if (!isCommand) {
        typed.addCommand("tessal_batch");
    }
    for (std::size_t i = isCommand ? command : 0; i < words.size(); ++i) {
        typed.addCommand(words[i].c_str());
    }
    return isCommand ? commandsWithHelp(typed) : ownOptionsWithHelp(typed);
}

bool isCompletionQuery(const std::string& line, std::string& asked) {
    if (!line.empty() && line.back() == '\t') {
        asked = line.substr(0, line.size() - 1);
        return true;
    }
    const std::size_t begin = line.find_first_not_of(blanks);
    const std::size_t end = line.find_first_of(blanks, begin);
    if (begin == std::string::npos || line.compare(begin, end - begin, queryWord) != 0) {
        return false;
    }
    asked = end != std::string::npos ? line.substr(end + 1) : "";
    return true;
}
