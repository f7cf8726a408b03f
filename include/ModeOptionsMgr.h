/// @file
/// The options of the file generation: CF, MPM and PFF files.
#pragma once

#include "ModeOption.h"
#include "OptionsMgr.h"

/// The option table of the file generation: CF, MPM and PFF files: set by enumerator, read as the switches of one
/// operation.
///
/// A new manager has all rows off and empty. A setter yields false, and changes nothing, for a row outside the table,
/// a text for a switch or a truth value for a text option. Range readers give the texts of their rows as
/// U_OptionsMgr::getOptions() tells, in row order. One thread at a time uses an object; a copy is independent.
class TESSAL_API ModeOptionsMgr : public U_OptionsMgr {
public:
    ModeOptionsMgr();

    using U_OptionsMgr::commit_options;
    using U_OptionsMgr::init_options;
    using U_OptionsMgr::setOption;

    /// "NumberOfModeOptions"
    HkString getNumberOfOptionsText() override;

    /// Appends the rows to the descriptions; the constructor has done so once.
    void init_attributes();
    /// Appends an unset value for each description; the constructor has done so once.
    void init_options();

    /// The number of descriptions.
    int getNumberOptions() const { return static_cast<int>(m_attributes.size()); }
    /// The key text of the row, such as "MODE_OPTIONS/CF_PATH"; empty where there is no such row.
    HkString getAttribute(tESSALNS::MODE_OPTION option) const;
    /// The row's enabled flag, which is the caller's alone; false where there is no such row.
    bool isEnabled(tESSALNS::MODE_OPTION option) const;
    bool setEnable(tESSALNS::MODE_OPTION option, bool enabled);

    /// Null counts as the empty text, which takes the option back.
    bool setOption(tESSALNS::MODE_OPTION option, const char* value);
    bool setOption(tESSALNS::MODE_OPTION option, HkString value);
    bool setOption(tESSALNS::MODE_OPTION option, bool value);
    /// Changes nothing: a value is in force as soon as it is set.
    void commit_options();

    std::vector<HkString> getCFGenerateOptions() const;
    std::vector<HkString> getMPMGenerateOptions() const;
    std::vector<HkString> getPFFGenerateOptions() const;

    void clearCFGenerateOptions();
    void clearMPMGenerateOptions();
    void clearPFFGenerateOptions();
    /// Resets every row, those of no operation too; the descriptions and the caller's flags stay.
    void clearAllOptions();

    /// A flag that the caller keeps here; no operation changes it.
    bool getOptionsModified() const { return m_optionsModified; }
    void setOptionsModified(bool modified) { m_optionsModified = modified; }

private:
    std::vector<U_OptionsPair> m_unused;  // holds its place in the layout; nothing fills it
    std::vector<U_AttributePair> m_attributes;
    bool m_optionsModified = false;
};
