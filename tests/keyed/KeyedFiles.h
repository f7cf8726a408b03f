// Data files for a test, and the search path set to them.
#pragma once

#include <filesystem>
#include <memory>
#include <string>

#include <gtest/gtest.h>

#include "DataPath.h"
#include "ProfileConfig.h"
#include "ProfileKeyTable.h"
#include "TemporaryDirectory.h"

namespace fs = std::filesystem;

/// Opens a table as the library's units do.
inline std::unique_ptr<ProfileKeyTable> openTable(const std::string& file, const char* profile = "base") {
    DeviceProfile::ProfileConfig config(profile, 1, ProfilePartBound);
    constexpr unsigned char on = 1;
    return std::make_unique<ProfileKeyTable>(file.c_str(), &config, on, on, on);
}

/// The whole value of a key, or null.
inline const char* valueOf(ProfileKeyTable& table, const char* key) {
    return table.getstringbykey(key, nullptr, 0, nullptr, 0);
}

/// A directory of the test's own, which is the search path while the test runs.
class KeyedFiles : public testing::Test {
protected:
    KeyedFiles() { DeviceProfile::setDataPath(m_directory.path().c_str()); }
    ~KeyedFiles() override { DeviceProfile::setDataPath(nullptr); }

    const TemporaryDirectory m_directory;
};
