#include "OptionsMgr.h"

#include <algorithm>
#include <utility>

#include "s/UnitOrigin.h"

namespace {

constexpr UnitOrigin origin{"../s/OptionsMgr", "$Revision: 1.1 $"};

bool isIndexOf(std::size_t size, int index) {
    return index >= 0 && static_cast<std::size_t>(index) < size;
}

std::size_t clamped(int index, std::size_t size) {
    return index < 0 ? 0 : std::min(static_cast<std::size_t>(index), size);
}

/// The description of a row; null where there is no such row.
template <class Attributes>
auto findDescription(Attributes& attributes, int index) -> decltype(attributes.data()) {
    return isIndexOf(attributes.size(), index) ? &attributes[static_cast<std::size_t>(index)] : nullptr;
}

}  // namespace

U_AttributePair::U_AttributePair(const char* attribute, bool isBool, const char* dashValue, int groupSize, bool enabled)
    : m_isBool(isBool), m_groupSize(groupSize), m_attribute(attribute), m_dashValue(dashValue), m_enabled(enabled) {}

U_OptionsPair::U_OptionsPair(HkString stringValue, bool boolValue, bool isBool)
    : m_boolValue(boolValue), m_stringValue(std::move(stringValue)), m_isBool(isBool) {}

U_OptionsMgr::U_OptionsMgr(std::vector<U_OptionsPair>& options) : m_options(options) {}

HkString U_OptionsMgr::getOptionEnabledText() {
    return "_OptionEnabled";
}

HkString U_OptionsMgr::getAssociatedDeviceText() {
    return "_AssociatedDevice";
}

void U_OptionsMgr::appendDescriptions(const tESSALNS::OptionRow* rows, std::size_t count, Attributes& attributes) {
    attributes.reserve(attributes.size() + count);
    std::for_each(rows, rows + count, [&attributes](const tESSALNS::OptionRow& row) {
        attributes.emplace_back(row.key, row.isSwitch(), row.dashValue, row.groupSize, true);
    });
}

HkString U_OptionsMgr::keyOf(const Attributes& attributes, int index) {
    const U_AttributePair* const description = findDescription(attributes, index);
    return description != nullptr ? description->m_attribute : HkString();
}

bool U_OptionsMgr::isRowEnabled(const Attributes& attributes, int index) {
    const U_AttributePair* const description = findDescription(attributes, index);
    return description != nullptr && description->m_enabled;
}

bool U_OptionsMgr::enableRow(Attributes& attributes, int index, bool enabled) {
    U_AttributePair* const description = findDescription(attributes, index);
    if (description != nullptr) {
        description->m_enabled = enabled;
    }
    return description != nullptr;
}

void U_OptionsMgr::appendRows(const Attributes& attributes) {
    m_options.reserve(m_options.size() + attributes.size());
    for (const U_AttributePair& attribute : attributes) {
        m_options.emplace_back(HkString(), false, attribute.m_isBool);
    }
}

void U_OptionsMgr::addOption(U_OptionsPair option) {
    m_options.push_back(std::move(option));
}

void U_OptionsMgr::setOptionsList(std::vector<U_OptionsPair> options) {
    m_options = std::move(options);
}

bool U_OptionsMgr::isRow(int index) const {
    return isIndexOf(m_options.size(), index);
}

bool U_OptionsMgr::setOption(int index, HkString stringValue, bool boolValue, bool isBool) {
    if (!isRow(index)) {
        return false;
    }
    U_OptionsPair& row = m_options[static_cast<std::size_t>(index)];
    row.m_isBool = isBool;
    row.m_boolValue = isBool && boolValue;
    if (isBool) {
        row.m_stringValue.Empty();
    } else {
        row.m_stringValue = std::move(stringValue);
    }
    return true;
}

bool U_OptionsMgr::writeText(const Attributes& attributes, int index, HkString value) {
    const U_AttributePair* const description = findDescription(attributes, index);
    return description != nullptr && !description->m_isBool && setOption(index, std::move(value), false, false);
}

bool U_OptionsMgr::writeSwitch(const Attributes& attributes, int index, bool value) {
    const U_AttributePair* const description = findDescription(attributes, index);
    return description != nullptr && description->m_isBool && setOption(index, HkString(), value, true);
}

bool U_OptionsMgr::isOptionSet(int index) const {
    return isOptionBool(index) && getOption(index);
}

HkString U_OptionsMgr::getOptionString(int index) const {
    return isRow(index) && !isOptionBool(index) ? m_options[static_cast<std::size_t>(index)].m_stringValue : HkString();
}

bool U_OptionsMgr::getOption(int index) const {
    return isRow(index) && m_options[static_cast<std::size_t>(index)].m_boolValue;
}

bool U_OptionsMgr::isOptionBool(int index) const {
    return isRow(index) && m_options[static_cast<std::size_t>(index)].m_isBool;
}

std::vector<HkString> U_OptionsMgr::texts(const Attributes& attributes, int first, int last) const {
    std::vector<HkString> result;
    const std::size_t rows = std::min(attributes.size(), m_options.size());
    const std::size_t end = clamped(last, rows);
    for (std::size_t i = clamped(first, rows); i < end; ++i) {
        const U_AttributePair& attribute = attributes[i];
        const U_OptionsPair& option = m_options[i];
        const std::size_t members =
            attribute.m_isBool ? std::min(clamped(attribute.m_groupSize, rows), rows - i - 1) : 0;
        if (!attribute.m_isBool) {
            if (!attribute.m_dashValue.IsEmpty() && !option.m_stringValue.IsEmpty()) {
                result.push_back(attribute.m_dashValue);
                result.push_back(option.m_stringValue);
            }
        } else if (option.m_boolValue) {
            result.push_back(groupText(attributes, i, i + 1 + members));
        }
        i += members;
    }
    return result;
}

/// The text of a switch and of its group's members, which stand behind it up to @p end.
HkString U_OptionsMgr::groupText(const Attributes& attributes, std::size_t leader, std::size_t end) const {
    HkString text = attributes[leader].m_dashValue;
    for (std::size_t member = leader + 1; member < end; ++member) {
        const U_AttributePair& attribute = attributes[member];
        const U_OptionsPair& option = m_options[member];
        if (attribute.m_isBool ? option.m_boolValue : !option.m_stringValue.IsEmpty()) {
            text += ' ';
            text += attribute.m_dashValue;
            text += attribute.m_isBool ? HkString() : option.m_stringValue;
        }
    }
    return text;
}

void U_OptionsMgr::clearOptions(int first, int last) {
    const std::size_t end = clamped(last, m_options.size());
    for (std::size_t i = clamped(first, m_options.size()); i < end; ++i) {
        m_options[i].m_boolValue = false;
        m_options[i].m_stringValue.Empty();
    }
}

void U_OptionsMgr::clearAllOptions() {
    for (U_OptionsPair& row : m_options) {
        row.m_boolValue = false;
        row.m_stringValue.Empty();
    }
}

void U_OptionsMgr::dumpAllOptions() const {
    int index = 0;
    for (const U_OptionsPair& row : m_options) {
        if (row.m_isBool) {
            origin.report().issueStatus("Value at index '%d' is: %d.\n", index, row.m_boolValue ? 1 : 0);
        } else {
            origin.report().issueStatus("Value at index '%d' is: %s.\n", index, row.m_stringValue.c_str());
        }
        ++index;
    }
}

// Callers hand their descriptions over by value.
// NOLINTBEGIN(performance-unnecessary-value-param)

void U_OptionsMgr::init_options(Attributes attributes) {
    appendRows(attributes);
}

bool U_OptionsMgr::setOption(Attributes attributes, int index, HkString value) {
    return writeText(attributes, index, std::move(value));
}

bool U_OptionsMgr::setOption(Attributes attributes, int index, const char* value) {
    return writeText(attributes, index, value);
}

bool U_OptionsMgr::setOption(Attributes attributes, int index, bool value) {
    return writeSwitch(attributes, index, value);
}

std::vector<HkString> U_OptionsMgr::getOptions(Attributes attributes, int first, int last) const {
    return texts(attributes, first, last);
}

void U_OptionsMgr::commit_options(Attributes) {}

void U_OptionsMgr::commit_options(int, Attributes) {}

// NOLINTEND(performance-unnecessary-value-param)
