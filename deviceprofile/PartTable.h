// The PROM parts of one data file.
#pragma once

#include "ProfileConfig.h"
#include "ProfileKeyTable.h"

namespace DeviceProfile {

/// The rows of `PROM_DEVICES`: a part's name and its size in bytes.
class PartTable {
public:
    PartTable(const char* dataFile, ProfileConfig& selection) : m_table(dataFile, &selection, 1, 1, 1) {}

    /// Null past the last row.
    const char* name(short row) { return cell(row, 0); }
    /// Null where the row has no size.
    const char* size(short row) { return cell(row, 1); }

private:
    const char* cell(short row, short field) { return m_table.getstringbykey("PROM_DEVICES", ":", row, ",", field); }

    ProfileKeyTable m_table;
};

}  // namespace DeviceProfile
