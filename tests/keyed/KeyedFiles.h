// Data files for a test, and the search path set to them.
#pragma once

#include <filesystem>
#include <fstream>
#include <iterator>
#include <memory>
#include <string>

#include <gtest/gtest.h>

#include "DataPath.h"
#include "ProfileConfig.h"
#include "ProfileKeyTable.h"
#include "TemporaryDirectory.h"

namespace fs = std::filesystem;

inline std::string bytesOf(const fs::path& path) {
    std::ifstream file(path, std::ios::binary);
    return {std::istreambuf_iterator<char>(file), std::istreambuf_iterator<char>()};
}

inline void writeFile(const fs::path& path, const std::string& bytes) {
    std::ofstream(path, std::ios::binary) << bytes;
}

/// Opens a table as the library's units do.
inline std::unique_ptr<ProfileKeyTable> openTable(const std::string& file, const char* profile = "base") {
    DeviceProfile::ProfileConfig config(profile, 1, ProfilePartBound);
    constexpr unsigned char on = 1;
    return std::make_unique<ProfileKeyTable>(file.c_str(), &config, on, on, on);
}

/// A directory of the test's own, which is the search path while the test runs.
class KeyedFiles : public testing::Test {
protected:
    KeyedFiles() { DeviceProfile::setDataPath(m_temporary.path().c_str()); }
    ~KeyedFiles() override { DeviceProfile::setDataPath(nullptr); }

    const TemporaryDirectory m_temporary;
    const fs::path m_directory = fs::u8path(m_temporary.path());
};
