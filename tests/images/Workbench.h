// A directory with data files, in which the generator runs.
#pragma once

#include <algorithm>
#include <memory>
#include <random>
#include <regex>
#include <string>

#include "CommandSet.h"
#include "MessageRecorder.h"
#include "PromUtility.h"
#include "TemporaryDirectory.h"

/// Bytes of no pattern.
inline std::string noise(std::size_t count, unsigned seed = 1) {
    std::minstd_rand random(seed);
    std::string result(count, '\0');
    std::generate(result.begin(), result.end(), [&] { return static_cast<char>(random() >> 8); });
    return result;
}

class Workbench : public TemporaryDirectory {
public:
    MessageRecorder messages;

    /// Runs "generate" with these arguments, in which "@" stands for the directory, and files in it, by default.
    bool generate(const std::string& arguments) {
        messages.clear();
        const std::string line =
            "generate -path " + path() + ' ' + std::regex_replace(arguments, std::regex("@"), path() + '/');
        const std::unique_ptr<CommandSet> command(CommandSet::string2CommandSet(line.c_str()));
        return PromUtility::generate(command.get());
    }

    /// All that was reported, without the directory.
    std::string said() const {
        std::string text;
        for (const RecordedMessage& message : messages.all()) {
            text += message.level == HkMessageLevel::Debug ? "" : message.text;
        }
        for (std::size_t at = 0; (at = text.find(path() + '/')) != std::string::npos;) {
            text.erase(at, path().size() + 1);
        }
        return text;
    }
};
