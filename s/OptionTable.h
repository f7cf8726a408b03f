// What the two option managers share: their rows as constants, from which the descriptions are made.
#pragma once

#include <cstddef>
#include <vector>

#include "OptionsMgr.h"

enum class OptionKind { Switch, Text };

struct OptionRow {
    const char* key;
    OptionKind kind;
    const char* dashValue;
    int groupSize;
};

/// The rows of one operation: from @p first up to but not including @p last.
struct OptionRange {
    int first;
    int last;
};

template <std::size_t size>
void appendDescriptions(const OptionRow (&rows)[size], std::vector<U_AttributePair>& attributes) {
    attributes.reserve(attributes.size() + size);
    for (const OptionRow& row : rows) {
        attributes.emplace_back(row.key, row.kind == OptionKind::Switch, row.dashValue, row.groupSize, true);
    }
}

/// The description of a row; null where there is no such row.
template <class Descriptions>
auto findDescription(Descriptions& attributes, int row) -> decltype(attributes.data()) {
    const bool isRow = row >= 0 && static_cast<std::size_t>(row) < attributes.size();
    return isRow ? &attributes[static_cast<std::size_t>(row)] : nullptr;
}

inline HkString keyOf(const std::vector<U_AttributePair>& attributes, int row) {
    const U_AttributePair* const description = findDescription(attributes, row);
    return description != nullptr ? description->getAttribute() : HkString();
}

inline bool isRowEnabled(const std::vector<U_AttributePair>& attributes, int row) {
    const U_AttributePair* const description = findDescription(attributes, row);
    return description != nullptr && description->isEnabled();
}

inline bool enableRow(std::vector<U_AttributePair>& attributes, int row, bool enabled) {
    U_AttributePair* const description = findDescription(attributes, row);
    if (description != nullptr) {
        description->setEnabled(enabled);
    }
    return description != nullptr;
}
