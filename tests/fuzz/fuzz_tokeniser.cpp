// The tokeniser agrees with its slow model on any line, and tokens joined with quotes and split again are the same.

#include <cstdlib>
#include <memory>
#include <optional>
#include <string>
#include <vector>

#include "CommandSet.h"
#include "HkMessageManager.h"
#include "TessalException.h"
#include "commands/TokeniserModel.h"

namespace {

using Words = std::vector<std::string>;

void require(bool condition) {
    if (!condition) {
        std::abort();
    }
}

/// The tokens of the line; nothing when the tokeniser refuses it.
std::optional<Words> split(const std::string& line) {
    try {
        const std::unique_ptr<CommandSet> commands(CommandSet::string2CommandSet(line.c_str()));
        Words words;
        for (int i = 0; commands != nullptr && i < commands->getNumberCommands(); ++i) {
            words.emplace_back(commands->getCommand(i));
        }
        return words;
    } catch (const DataMismatchException&) {
        return std::nullopt;
    }
}

/// A line of these tokens in quotes; an empty one needs a letter that is dropped.
std::string join(const Words& words) {
    std::string line;
    for (const std::string& word : words) {
        line += (word.empty() ? "x\"" : "\"") + word + "\" ";
    }
    return line;
}

}  // namespace

extern "C" int LLVMFuzzerTestOneInput(const unsigned char* data, std::size_t size) {
    HkMessageManager::setHandler([](const HkMessage&, void*) {}, nullptr);
    // As the library sees it, the line ends at the first zero byte.
    const std::string line(std::string(reinterpret_cast<const char*>(data), size).c_str());
    const std::optional<Words> words = split(line);
    require(words == splitByModel(line));
    if (words) {
        require(split(join(*words)) == words);
    }
    return 0;
}
