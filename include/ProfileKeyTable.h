/// @file
/// Keyed access to one section of a data file.
#pragma once

#include <memory>

#include "TessalExport.h"

class CellStore;
class ProfilePick;

/// The keys of one profile in one data file, read once when the table is built.
///
/// A lookup names a cell by five values: the key, a row separator, a row index, a field separator and a field index.
/// The value is split at the row separator and the row at the field separator; n separators make n + 1 pieces, so
/// `a,,b` has an empty middle field and `a,` a last empty one. A separator that is null or empty does not split: then
/// there is one row, or one field, of index 0. A separator of several characters is looked for as a whole.
///
/// | form         | row separator | row | field separator | field |
/// |--------------|---------------|-----|-----------------|-------|
/// | whole value  | null          | 0   | null            | 0     |
/// | list element | ","           | i   | null            | 0     |
/// | table cell   | ":"           | row | ","             | field |
///
/// A value is split once for each pair of separators that is used on it, so that counting an index up to the first
/// null reads a table in linear time. Each pair costs a copy of the value. A table belongs to one thread at a time.
class TESSAL_API ProfileKeyTable {
public:
    /// Reads the section of the pick's profile; a pick without a profile, or no pick, stands for "base".
    ///
    /// @param dataFile file name such as "tessal.acd", looked for as setDataPath tells; an absolute path is taken as
    ///        it is
    /// @param pick the selection; it is read here and not needed afterwards
    /// @param reportAbsent non-zero: a file that cannot be found or read gives one information message
    /// @param reportMalformed non-zero: a line that is no comment, section or key gives an information message
    /// @param reportRepeated non-zero: a key set twice gives an information message; the later value holds
    ///
    /// A file that cannot be read gives a table without keys.
    ProfileKeyTable(const char* dataFile, ProfilePick* pick, unsigned char reportAbsent, unsigned char reportMalformed,
                    unsigned char reportRepeated);
    ~ProfileKeyTable();
    ProfileKeyTable(const ProfileKeyTable&) = delete;
    ProfileKeyTable& operator=(const ProfileKeyTable&) = delete;

    /// The text of a cell, or null when there is no such key, row or field. The text belongs to the table and lives
    /// as long as it.
    const char* getstringbykey(const char* key, const char* rowSeparator, short rowIndex, const char* fieldSeparator,
                               short fieldIndex);

    /// The decimal number at the start of a cell, as HkStr::AToI reads it; 0 where there is no cell or no number.
    int GetInt32ByKey(const char* key, const char* rowSeparator, short rowIndex, const char* fieldSeparator,
                      short fieldIndex);

private:
    std::unique_ptr<CellStore> m_cells;
};
