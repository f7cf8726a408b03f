// The lines of a script, with their numbers.
#pragma once

#include <istream>
#include <string>

/// Reads lines that end in LF or CRLF; a byte-order mark before the first one is dropped.
class LineSource {
public:
    explicit LineSource(std::istream& stream) : m_stream(stream) {}

    /// The next line without its end; false when there is none.
    bool next(std::string& line);

    /// The number of the line read last, counted from 1.
    int number() const { return m_number; }

    /// True when reading ended before the end of the file.
    bool hasFailed() const { return m_stream.bad(); }

private:
    std::istream& m_stream;
    int m_number = 0;
};
