// What a key table holds: the section's keys and the values that were split.
#pragma once

#include <cstring>
#include <map>
#include <string>
#include <string_view>
#include <tuple>

#include "deviceprofile/CellIndex.h"
#include "deviceprofile/FileText.h"
#include "deviceprofile/KeyList.h"
#include "deviceprofile/SectionReader.h"

class CellStore {
public:
    /// Takes the section's keys out of the text; without bytes there are none.
    CellStore(DeviceProfile::FileText text, std::string_view section, DeviceProfile::LineReports reports);

    /// The cell lookup of ProfileKeyTable::getstringbykey.
    const char* cell(const char* key, const char* rowSeparator, int row, const char* fieldSeparator, int field);

private:
    using SplitName = std::tuple<std::string_view, std::string, std::string>;  ///< key and both separators
    using Splits = std::map<SplitName, DeviceProfile::CellIndex>;

    /// The split value of the key, or null when there is no such key.
    const DeviceProfile::CellIndex* split(const char* key, const char* rowSeparator, const char* fieldSeparator);

    DeviceProfile::FileText m_text;
    DeviceProfile::KeyList m_keys;
    Splits m_splits;
    const Splits::value_type* m_last = nullptr;  ///< the split that was asked last
};
