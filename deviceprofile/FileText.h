// A data file in memory.
#pragma once

#include <cstddef>
#include <filesystem>
#include <memory>
#include <string>

#include "deviceprofile/DataSearch.h"

namespace DeviceProfile {

/// The bytes of a file, with one more byte behind them that a terminator can be written to.
struct FileText {
    std::unique_ptr<char[]> bytes;
    std::size_t size = 0;
    std::string name;  ///< the path in UTF-8, for messages
};

/// Reads a whole file of at most 1 GiB, whatever is in it; pipes and devices are not opened. Gives null, or what is
/// wrong with it: a constant text such as "is a directory".
const char* readBytes(const std::filesystem::path& path, FileText& result);

/// The same for text: a binary file is refused.
const char* readFile(const std::filesystem::path& path, FileText& result);

/// Reads the first file of this name that can be read. Without one the result is empty and, with @p report, one
/// message tells where was searched and what was wrong.
FileText openDataFile(const std::string& name, bool report);

}  // namespace DeviceProfile
