/// @file
/// The options of the file generation: CF, MPM and PFF files.
#pragma once

#include "ModeOption.h"
#include "OptionTableMgr.h"

/// The option table of the file generation: set by enumerator, read as the switches of one operation.
class TESSAL_API ModeOptionsMgr : public OptionTableMgr<tESSALNS::MODE_OPTION> {
public:
    ModeOptionsMgr();

    /// "NumberOfModeOptions"
    HkString getNumberOfOptionsText() override;

    /// Appends the rows to the descriptions; the constructor has done so once.
    void init_attributes();

    std::vector<HkString> getCFGenerateOptions() const;
    std::vector<HkString> getMPMGenerateOptions() const;
    std::vector<HkString> getPFFGenerateOptions() const;

    void clearCFGenerateOptions();
    void clearMPMGenerateOptions();
    void clearPFFGenerateOptions();
};
