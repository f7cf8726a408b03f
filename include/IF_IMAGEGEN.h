/// @file
/// The PROM file generator.
#pragma once

#include "HkCmdArgs.h"
#include "TessalExport.h"

/// Writes the files of one PROM or of several from data files.
///
///     const HkCmdArgs args(argc, argv, IF_IMAGEGEN::getcmdformat(), nullptr, 0);
///     IF_IMAGEGEN generator(&args);
///     const bool isDone = generator.makeprom() == 0;
///
/// Data files are placed at addresses, upwards or downwards, and spread over the PROMs in their order: where one is
/// full the next goes on, and each has a file of its own that counts from 0. The bits of each byte are reversed unless
/// `-disableswap` is given. docs/prom-files.md tells every argument and file format.
class TESSAL_API IF_IMAGEGEN {
public:
    /// The argument format of the generator's command, in the syntax of HkCmdArgs; static text.
    static const char* getcmdformat();

    /// @param command the parsed command, which outlives the generator
    explicit IF_IMAGEGEN(const HkCmdArgs* command);
    ~IF_IMAGEGEN() = default;
    IF_IMAGEGEN(const IF_IMAGEGEN&) = delete;
    IF_IMAGEGEN& operator=(const IF_IMAGEGEN&) = delete;

    /// Builds the files. 0 on success, with one status message for each PROM: its file, addresses and checksum. On
    /// failure an information message tells what is wrong, there is no new file, and the old ones are as they were.
    ///
    /// The checksum is the sum of all bytes of the PROM in 32 bits, as its file holds them; what the file leaves open
    /// counts as the fill byte, 0xFF unless told otherwise. The writing is reported to ProgressInterfaceClass, so one
    /// thread at a time generates; an end with fewer steps than the operation has says that it failed.
    unsigned char makeprom();

private:
    const HkCmdArgs* m_command;
};
