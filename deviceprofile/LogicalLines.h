// The lines of a data file that mean something: continuation joined, comments and blank lines left out.
#pragma once

#include <cstdint>

namespace DeviceProfile {

struct LogicalLine {
    char* begin;           ///< first non-blank character
    char* end;             ///< behind the last one; a zero stands there
    char* equals;          ///< the first `=`, null where there is none or the line begins with `[`
    std::uint32_t number;  ///< of its first physical line, counted from 1
    bool isCutOff;         ///< the file ends where the line should go on
};

/// Goes through a text line by line and joins in place, so the text must be writable, one byte behind it too.
///
/// Lines end in LF or CRLF. A line goes on in the next one when it has a `=` and its last character is a backslash.
class LogicalLines {
public:
    LogicalLines(char* begin, char* end);

    /// Sets @p line to the next line; false at the end of the text.
    bool next(LogicalLine& line);

private:
    void joinContinuation(LogicalLine& line);

    char* m_position;
    char* m_end;
    std::uint32_t m_number = 0;
};

}  // namespace DeviceProfile
