// The tokeniser agrees with its slow model on any line.
#include <memory>
#include <optional>
#include <string>
#include <vector>

#include "CommandSet.h"
#include "TessalException.h"
#include "commands/TokeniserModel.h"
#include "fuzz/Fuzz.h"

namespace {

/// The tokens of the line; nothing when the tokeniser refuses it.
std::optional<std::vector<std::string>> split(const std::string& line) {
    try {
        const std::unique_ptr<CommandSet> commands(CommandSet::string2CommandSet(line.c_str()));
        std::vector<std::string> words;
        for (int i = 0; commands != nullptr && i < commands->getNumberCommands(); ++i) {
            words.emplace_back(commands->getCommand(i));
        }
        return words;
    } catch (const DataMismatchException&) {
        return std::nullopt;
    }
}

}  // namespace

void fuzz(Input input) {
    const std::string line = input.text();
    require(split(line) == splitByModel(line));
}
