// The lines of a data file that mean something, without comments and blank lines.
#pragma once

#include <cstdint>

namespace DeviceProfile {

struct LogicalLine {
    char* begin;           ///< first non-blank character
    char* end;             ///< behind the last one, where a zero stands; of a continued line where the next one begins
    char* equals;          ///< the first `=`, null where there is none or the line begins with `[`
    std::uint32_t number;  ///< of its first physical line, counted from 1
    bool isContinued;      ///< it has several pieces, for joinPieces
    bool isCutOff;         ///< the file ends where the line should go on
};

/// Joins a continued line in place from a non-blank place in its first piece on: the backslashes, the ends of the
/// pieces and the blanks at their begins are left out. Gives the place behind the last non-blank character, where it
/// sets a zero.
///
/// @param lineEnd the line's end
char* joinPieces(char* begin, char* lineEnd);

/// Goes through a text line by line. The text must be writable, one byte behind it too.
///
/// Lines end in LF or CRLF. A line goes on in the next one when it has a `=` and its last character is a backslash.
/// Such a line is not joined here, for most values are never asked for, and copying costs more than finding its end.
class LogicalLines {
public:
    LogicalLines(char* begin, char* end);

    /// Sets @p line to the next line; false at the end of the text.
    bool next(LogicalLine& line);

private:
    void findLastPiece(LogicalLine& line);

    char* m_position;
    char* m_end;
    std::uint32_t m_number = 0;
};

}  // namespace DeviceProfile
