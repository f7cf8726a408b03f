/// @file
/// The options of the operations on a device: program, erase, read back, verify and customer code.
#pragma once

#include "OptionTableMgr.h"
#include "ProgramOption.h"

/// An option manager with a size that the caller keeps beside the options.
class OptionsMgrWithUESSize : public U_OptionsMgr {
public:
    int getUESSize() const { return m_uesSize; }
    void setUESSize(int size) { m_uesSize = size; }

private:
    int m_uesSize = 0;
};

/// The option table of the operations on a device: set by enumerator, read as the switches of one operation.
class TESSAL_API DeviceOptionsMgr : public OptionTableMgr<tESSALNS::PROGRAM_OPTION, OptionsMgrWithUESSize> {
public:
    DeviceOptionsMgr();

    /// "NumberOfDeviceOptions"
    HkString getNumberOfOptionsText() override;

    /// Appends the rows to the descriptions, as the constructor has done once, and sets the size to 0.
    void init_attributes();

    std::vector<HkString> getProgramOptions() const;
    std::vector<HkString> getEraseOptions() const;
    std::vector<HkString> getReadbackOptions() const;
    std::vector<HkString> getVerifyOptions() const;
    std::vector<HkString> getCustCodeOptions() const;

    void clearProgramOptions();
    void clearEraseOptions();
    void clearReadbackOptions();
};
