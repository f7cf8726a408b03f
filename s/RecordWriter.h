// Writes the text stream form of records, which RecordReader.h reads.
#pragma once

#include <array>
#include <cstddef>
#include <iosfwd>
#include <string_view>

/// Gathers the fields of one record, so that the stream sees a single write; more than one where the record is long.
class RecordWriter {
public:
    explicit RecordWriter(std::ostream& out) : m_out(out) {}
    void addInt(int value);
    /// Null counts as the empty text.
    void addText(const char* text);
    /// The text alone, without its length, and a line feed.
    void addLine(const char* text);
    /// Writes what has been gathered, behind the last field.
    void finish();

private:
    void addLine(std::string_view text);
    /// A place for @p size bytes behind what has been gathered, not more than the form holds.
    char* room(std::size_t size);
    void flush();

    std::ostream& m_out;
    std::size_t m_size = 0;
    std::array<char, 256> m_form;  // only what has been gathered is ever read
};
