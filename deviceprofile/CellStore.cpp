#include "deviceprofile/CellStore.h"

#include <utility>

using DeviceProfile::CellIndex;

CellStore::CellStore(DeviceProfile::FileText text, std::string_view section, DeviceProfile::LineReports reports)
    : m_text(std::move(text)), m_keys(DeviceProfile::readSection(m_text, section, reports)) {}

const char* CellStore::find(const char* key, const char* rowSeparator, int row, const char* fieldSeparator, int field) {
    const char* const place = m_keys.find(key);
    if (place == nullptr) {
        return nullptr;
    }
    const char* const value = place + std::strlen(place) + 1;
    if (*rowSeparator == '\0' && *fieldSeparator == '\0') {
        return row == 0 && field == 0 ? value : nullptr;
    }
    auto found = m_splits.find({place, rowSeparator, fieldSeparator});
    if (found == m_splits.end()) {
        found =
            m_splits
                .emplace(SplitName(place, rowSeparator, fieldSeparator), CellIndex(value, rowSeparator, fieldSeparator))
                .first;
    }
    const auto& [name, cells] = *found;
    m_last = Split{place, std::get<1>(name).c_str(), std::get<2>(name).c_str(), &cells};
    return cells.at(row, field);
}
