/// @file
/// The options of the operations on a device: program, erase, read back, verify and customer code.
#pragma once

#include "OptionsMgr.h"
#include "ProgramOption.h"

/// The option table of the operations on a device: program, erase, read back, verify and customer code: set by
/// enumerator, read as the switches of one operation.
///
/// A new manager has all rows off and empty. A setter yields false, and changes nothing, for a row outside the table,
/// a text for a switch or a truth value for a text option. Range readers give the texts of their rows as
/// U_OptionsMgr::getOptions() tells, in row order. One thread at a time uses an object; a copy is independent.
class TESSAL_API DeviceOptionsMgr : public U_OptionsMgr {
public:
    DeviceOptionsMgr();

    using U_OptionsMgr::commit_options;
    using U_OptionsMgr::init_options;
    using U_OptionsMgr::setOption;

    /// "NumberOfDeviceOptions"
    HkString getNumberOfOptionsText() override;

    /// Appends the rows to the descriptions; the constructor has done so once.
    void init_attributes();
    /// Appends an unset value for each description; the constructor has done so once.
    void init_options();

    /// The number of descriptions.
    int getNumberOptions() const { return static_cast<int>(m_attributes.size()); }
    /// The key text of the row, such as "PROGRAM_OPTIONS/VERIFY"; empty where there is no such row.
    HkString getAttribute(tESSALNS::PROGRAM_OPTION option) const;
    /// The row's enabled flag, which is the caller's alone; false where there is no such row.
    bool isEnabled(tESSALNS::PROGRAM_OPTION option) const;
    bool setEnable(tESSALNS::PROGRAM_OPTION option, bool enabled);

    /// Null counts as the empty text, which takes the option back.
    bool setOption(tESSALNS::PROGRAM_OPTION option, const char* value);
    bool setOption(tESSALNS::PROGRAM_OPTION option, HkString value);
    bool setOption(tESSALNS::PROGRAM_OPTION option, bool value);
    /// Changes nothing: a value is in force as soon as it is set.
    void commit_options();

    std::vector<HkString> getProgramOptions() const;
    std::vector<HkString> getEraseOptions() const;
    std::vector<HkString> getReadbackOptions() const;
    std::vector<HkString> getVerifyOptions() const;
    std::vector<HkString> getCustCodeOptions() const;

    void clearProgramOptions();
    void clearEraseOptions();
    void clearReadbackOptions();
    /// Resets every row, those of no operation too; the descriptions and the caller's flags stay.
    void clearAllOptions();

    /// A size that the caller keeps here.
    int getUESSize() const { return m_uesSize; }
    void setUESSize(int size) { m_uesSize = size; }
    /// A flag that the caller keeps here; no operation changes it.
    bool getOptionsModified() const { return m_optionsModified; }
    void setOptionsModified(bool modified) { m_optionsModified = modified; }

private:
    int m_uesSize = 0;
    std::vector<U_OptionsPair> m_unused;  // holds its place in the layout; nothing fills it
    std::vector<U_AttributePair> m_attributes;
    bool m_optionsModified = false;
};
