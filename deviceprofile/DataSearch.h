// The directories of the data files and the way to a file in them.
#pragma once

#include <filesystem>
#include <string>
#include <vector>

namespace DeviceProfile {

/// The first source of directories that is set.
struct SearchPath {
    const char* source;                    ///< what named the directories, for messages
    std::vector<std::string> directories;  ///< UTF-8, never empty texts

    /// The directories as one list, separated as on the host.
    std::string text() const;
};

SearchPath searchPath();

/// A path from UTF-8; empty where the host cannot take the text.
std::filesystem::path pathOf(const std::string& utf8);

/// The places where a file of this name is looked for, in order: one in each directory, or the name itself when it is
/// an absolute path.
std::vector<std::filesystem::path> placesOf(const std::string& name);

/// The directory that holds "bin" and "lib" of this installation; empty when the host does not tell.
std::filesystem::path installationPrefix();

}  // namespace DeviceProfile
