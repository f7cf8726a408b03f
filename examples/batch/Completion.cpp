#include "Completion.h"

#include <TessalUtility.h>

#include <memory>
#include <vector>

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

std::vector<HkString> candidatesFor(CommandSet& words) {
    if (words.getNumberCommands() == 1) {
        return TessalCmdargs::findMatchingCommands(words.getCommand(0));
    }
    HkString command(words.getCommand(0));
    command.MakeLower();
    const char* const format = TessalCmdargs::findBatchFormatString(command);
    return HkCmdArgs::complete(words.getNumberCommands(), words.getCommands(), format);
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
