/// @file
/// The reader of object and memory files.
#pragma once

#include <cstdint>

#include "TessalExport.h"

/// How a file is read: 0, or some of these added.
enum DataDumpType : std::int32_t {
    DUMP_BY_DEFAULT = 0,
    DUMP_LEAST_SIGNIFICANT_FIRST = 1,  ///< memory text: a word's rightmost digits go to the lowest address
    DUMP_BYTE_ADDRESSES = 2,           ///< memory text: "@" counts bytes, not words
    DUMP_FILL_UNKNOWN = 4              ///< memory text: unknown bits, `x` and `z`, read as ones
};

/// The results of the reader.
struct M2IUtil_BramMapping {
    enum M2IUtil_Results : std::int32_t {
        M2IUTIL_SUCCESS = 0,
        M2IUTIL_UNREADABLE = 1,  ///< the file is not there, no plain file, or larger than 1 GiB
        M2IUTIL_MALFORMED = 2    ///< what is in it is no object or memory file, or cut short, or contradicts itself
    };
};

/// The program sections of an object file or memory text, read at construction.
///
/// A file whose extension is "mem" in any case is memory text: "@address" and words of hexadecimal digits. Any other
/// file is taken for ELF, of 32 or 64 bits and either byte order, of which the loaded parts count, at their load
/// addresses. docs/prom-files.md has both forms. What is wrong with a file is reported in information messages with
/// the place; no content of a file makes the reader fail in another way.
class TESSAL_API M2IUtil_Data_Utils {
public:
    /// @param result receives 0 on success, any other value on failure; may be null
    M2IUtil_Data_Utils(const char* path, DataDumpType dumpType, M2IUtil_BramMapping::M2IUtil_Results* result);
    ~M2IUtil_Data_Utils() = default;
    M2IUtil_Data_Utils(const M2IUtil_Data_Utils&) = delete;
    M2IUtil_Data_Utils& operator=(const M2IUtil_Data_Utils&) = delete;

    /// The lowest address and the one behind the last byte, so that their difference is the size; an end at 4 GiB
    /// reads as 0. Both are 0 after a failure and for a file without data. A null pointer is passed over.
    void GetProgramSectionAddressRange(unsigned int* lowest, unsigned int* highest) const;

private:
    unsigned int m_lowest = 0;
    unsigned int m_highest = 0;
};
