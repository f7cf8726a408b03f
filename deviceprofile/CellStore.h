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
    /// Takes the section's keys out of the text.
    CellStore(DeviceProfile::FileText text, std::string_view section, DeviceProfile::LineReports reports);

    /// The cell lookup of ProfileKeyTable::getstringbykey; no text is null.
    const char* cell(const char* key, const char* rowSeparator, int row, const char* fieldSeparator, int field) {
        const bool isAskedAgain = m_last.cells != nullptr && std::strcmp(m_last.key, key) == 0 &&
                                  isSame(m_last.fieldSeparator, fieldSeparator) &&
                                  isSame(m_last.rowSeparator, rowSeparator);
        return isAskedAgain ? m_last.cells->at(row, field) : find(key, rowSeparator, row, fieldSeparator, field);
    }

private:
    /// Place of the key and both separators.
    using SplitName = std::tuple<const char*, std::string, std::string>;
    using Splits = std::map<SplitName, DeviceProfile::CellIndex>;

    struct Split {
        const char* key;
        const char* rowSeparator;
        const char* fieldSeparator;
        const DeviceProfile::CellIndex* cells;
    };

    /// Compares separators, which mostly have one character, without a call for these.
    static bool isSame(const char* a, const char* b) {
        return a[0] == b[0] && (a[0] == '\0' || (a[1] == b[1] && (a[1] == '\0' || std::strcmp(a + 2, b + 2) == 0)));
    }

    /// The same lookup for another key or other separators than the last ones.
    const char* find(const char* key, const char* rowSeparator, int row, const char* fieldSeparator, int field);

    DeviceProfile::FileText m_text;
    DeviceProfile::KeyList m_keys;
    Splits m_splits;
    Split m_last{};  ///< what was asked last
};
