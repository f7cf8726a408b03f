/// @file
/// What the managers of the two option tables have in common.
#pragma once

#include <cstddef>
#include <utility>
#include <vector>

#include "OptionRow.h"
#include "OptionsMgr.h"

/// An option manager that owns its descriptions and takes its rows by the enumerators of @p Option.
///
/// A new manager has all rows off and empty. A setter yields false, and changes nothing, for a row outside the table,
/// a text for a switch or a truth value for a text option. The derived class has a reader for each range of rows; the
/// readers give the texts of their rows as U_OptionsMgr::getOptions() tells, in row order. One thread at a time uses
/// an object; a copy is independent.
///
/// @p Base is U_OptionsMgr, or a class derived from it whose fields stand before those of this one.
template <class Option, class Base = U_OptionsMgr>
class OptionTableMgr : public Base {
public:
    using Base::commit_options;
    using Base::init_options;
    using Base::setOption;

    /// Appends an unset value for each description; the constructor has done so once.
    void init_options() { this->appendRows(m_attributes); }

    /// The number of descriptions.
    int getNumberOptions() const { return static_cast<int>(m_attributes.size()); }
    /// The key text of the row, such as "PROGRAM_OPTIONS/VERIFY"; empty where there is no such row.
    HkString getAttribute(Option option) const { return this->keyOf(m_attributes, option); }
    /// The row's enabled flag, which is the caller's alone; false where there is no such row.
    bool isEnabled(Option option) const { return this->isRowEnabled(m_attributes, option); }
    bool setEnable(Option option, bool enabled) { return this->enableRow(m_attributes, option, enabled); }

    /// Null counts as the empty text, which takes the option back.
    bool setOption(Option option, const char* value) { return setOption(option, HkString(value)); }
    bool setOption(Option option, HkString value) { return this->writeText(m_attributes, option, std::move(value)); }
    bool setOption(Option option, bool value) { return this->writeSwitch(m_attributes, option, value); }
    /// Changes nothing: a value is in force as soon as it is set.
    void commit_options() {}

    /// Resets every row, those of no operation too; the descriptions and the caller's flags stay.
    void clearAllOptions() {
        Base::clearAllOptions();
        commit_options();
    }

    /// A flag that the caller keeps here; no operation changes it.
    bool getOptionsModified() const { return m_optionsModified; }
    void setOptionsModified(bool modified) { m_optionsModified = modified; }

protected:
    template <std::size_t size>
    void addDescriptions(const tESSALNS::OptionRow (&rows)[size]) {
        this->appendDescriptions(rows, size, m_attributes);
    }
    std::vector<HkString> textsOf(tESSALNS::OptionRange rows) const {
        return this->texts(m_attributes, rows.first, rows.last);
    }

private:
    std::vector<U_OptionsPair> m_unused;  // holds its place in the layout; nothing fills it
    std::vector<U_AttributePair> m_attributes;
    bool m_optionsModified = false;
};
