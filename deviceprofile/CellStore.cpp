#include "deviceprofile/CellStore.h"

#include <utility>

using DeviceProfile::CellIndex;
using DeviceProfile::KeyEntry;

namespace {

/// Compares texts that mostly have one character, without a call for these.
bool isSame(const std::string& a, const char* b) {
    return a.size() == 1 ? b[0] == a[0] && b[1] == '\0' : std::strcmp(a.c_str(), b) == 0;
}

}  // namespace

CellStore::CellStore(DeviceProfile::FileText text, std::string_view section, DeviceProfile::LineReports reports)
    : m_text(std::move(text)) {
    if (m_text.bytes != nullptr) {
        m_keys = DeviceProfile::readSection(m_text, section, reports);
    }
}

const CellIndex* CellStore::split(const char* key, const char* rowSeparator, const char* fieldSeparator) {
    if (m_last != nullptr) {
        const auto& [lastKey, lastRow, lastField] = m_last->first;
        if (std::strcmp(lastKey.data(), key) == 0 && isSame(lastField, fieldSeparator) &&
            isSame(lastRow, rowSeparator)) {
            return &m_last->second;
        }
    }
    const KeyEntry* const entry = m_keys.find(key);
    if (entry == nullptr) {
        return nullptr;
    }
    SplitName name{entry->key, rowSeparator, fieldSeparator};
    auto found = m_splits.find(name);
    if (found == m_splits.end()) {
        CellIndex index(entry->value, rowSeparator, fieldSeparator);
        found = m_splits.emplace(std::move(name), std::move(index)).first;
    }
    m_last = &*found;
    return &m_last->second;
}

const char* CellStore::cell(const char* key, const char* rowSeparator, int row, const char* fieldSeparator, int field) {
    if (key == nullptr) {
        return nullptr;
    }
    const char* const rows = rowSeparator != nullptr ? rowSeparator : "";
    const char* const fields = fieldSeparator != nullptr ? fieldSeparator : "";
    if (*rows == '\0' && *fields == '\0') {
        const KeyEntry* const entry = row == 0 && field == 0 ? m_keys.find(key) : nullptr;
        return entry != nullptr ? entry->value.data() : nullptr;
    }
    const CellIndex* const cells = split(key, rows, fields);
    return cells != nullptr ? cells->at(row, field) : nullptr;
}
