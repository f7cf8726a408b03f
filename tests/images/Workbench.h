// A directory with data files, in which the generator runs.
#pragma once

#include <algorithm>
#include <filesystem>
#include <map>
#include <memory>
#include <random>
#include <regex>
#include <string>
#include <tuple>

#include "CommandSet.h"
#include "M2IUtil_Data_Utils.h"
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

/// The reader's result for an object file or memory text, the lowest address, and the one behind the last byte.
using SectionRange = std::tuple<M2IUtil_BramMapping::M2IUtil_Results, unsigned int, unsigned int>;

inline SectionRange sectionRange(const std::string& path) {
    SectionRange range{{}, 1, 1};
    auto& [result, lowest, highest] = range;
    const M2IUtil_Data_Utils reader(path.c_str(), DUMP_BY_DEFAULT, &result);
    reader.GetProgramSectionAddressRange(&lowest, &highest);
    return range;
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

    /// The files by their names, and the directories.
    std::map<std::string, std::string> content() const {
        std::map<std::string, std::string> files;
        for (const auto& entry : std::filesystem::directory_iterator(path())) {
            const std::string name = entry.path().filename().string();
            files[name] = entry.is_directory() ? "directory" : read(name);
        }
        return files;
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
