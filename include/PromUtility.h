/// @file
/// PROM support: the catalogue of parts, combined addresses, file generation and sizes, row checksums.
#pragma once

#include <memory>
#include <vector>

#include "CommandSet.h"
#include "HkString.h"
#include "RLBitVec.h"
#include "TessalExport.h"

/// A part of the catalogue: its name and its size as the data file writes it, empty where the file has none.
struct promPartAndSizePair {
    HkString partName;
    HkString sizeText;
};

/// Static operations around configuration PROMs. The part lists are read once, at the first use of any of them, by
/// one thread; everything else holds no state.
class TESSAL_API PromUtility {
public:
    PromUtility() = delete;

    // The catalogue: the key `PROM_DEVICES` of "proms.acd" (the standard list), "tessal.acd" (the extended list) and
    // "proms.dat".

    /// Reads both lists at the first call; always true. A read that failed is not tried again.
    static bool readPromList();
    /// A copy of the standard list, in the order of the file.
    static std::vector<promPartAndSizePair> GetPromList();
    /// A copy of the extended list.
    static std::vector<promPartAndSizePair> GetExtendedPromList();
    /// The parts of the standard list that belong to a family: "legacy", "zqr", "version", "bpi" or "parallel", in any
    /// case. Any other family has no parts.
    static std::vector<promPartAndSizePair> GetSpecificPromList(const char* family);
    /// The size of a part of "proms.dat", named in any case; -1 where it is not there. Reads the file at each call.
    /// Throws OutOfRangeException where the part has no size.
    static int GetPromSizeByName(const char* part);
    /// The same in "proms.acd" and, where that has no such part, in "tessal.acd".
    static int GetExtendedPromSizeByName(const char* part);

    // Combined addresses: a start address with the values of the two RS pins in the top two of addressBits bits.

    /// Puts the pins, two characters of which "1" sets a bit and "0" does not, on top of the start address. The bits
    /// are added, so a start address that reaches them carries. No pins, null or empty, leave the address; a text of
    /// another length is reported and leaves it too.
    static unsigned int GetRSPinAndStartAddressCombo(const char* rsPin, unsigned int start, int addressBits);
    /// The same on hexadecimal text, as Hex2Bit reads and writes it; upper-case digits.
    static HkString GetRSPinAndStartAddressCombo(const char* rsPin, const char* startHex, int addressBits);
    /// Takes pins and start address apart. Pins that come in as "00" say that none are in use: the address is taken
    /// whole.
    static void DecomposeComboAddress(unsigned int combo, HkString& rsPin, unsigned int& start, int addressBits);
    static void DecomposeComboAddress(HkString comboHex, HkString& rsPin, HkString& startHex, int addressBits);

    /// Runs the PROM file generator on a tokenised command, whose first token is the command word. The generator
    /// reports by itself, its progress too; true on success.
    static bool generate(CommandSet* command);
    /// How much space the data of a file will need, in bytes: for "*.elf" and "*.mem", in this case of letters, the
    /// span of its program sections, for any other file its size, modulo 2^32. 0, with a message, where an object or
    /// memory file cannot be read.
    static unsigned int getDataFileSize(const char* path);

    /// Adds one row of the data file and of the device to the running sums; the last row gives the verdict.
    ///
    /// A sum is that of the row's bytes, in 32 bits that wrap. A row is read from its highest index down: the first of
    /// eight bits is the least significant of a byte, so that under the usual numbering the stored bytes are summed.
    /// With the last row every byte of the PROM behind the file's data counts as 0xFF in both sums, which are then
    /// compared and reported.
    ///
    /// While the environment variable `ZRX_TESSAL_ZQ7300DUMPCHECKSUMDATA` is set, the file's sum is reported bit by
    /// bit.
    ///
    /// @param fileBits,deviceBits bits of each row, a multiple of 8 and at most its length; below 1: no row
    /// @param bitsDone bits of the file handled before this row
    /// @param totalBits bits of the whole PROM
    /// @return with @p lastRow the device's sum as text, which the caller releases with `delete[]`; otherwise null
    static char* rowChecksum(int ignored, RLBitVec* fileRow, int fileBits, RLBitVec* deviceRow, int deviceBits,
                             bool lastRow, int& fileChecksum, int& deviceChecksum, int bitsDone, int totalBits);
};
