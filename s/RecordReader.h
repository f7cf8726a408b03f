// Reads the text stream form of records, which RecordWriter.h writes.
#pragma once

#include <iosfwd>
#include <string>
#include <string_view>

#include "s/ReadyText.h"

/// Reads the fields of one record from the stream's buffer.
///
/// It does not use the stream's operators: those obey the locale, base and width that the caller's stream happens to
/// have, and they cost several times as much. The stream itself must be left alone until the reader is gone.
class RecordReader {
public:
    explicit RecordReader(std::istream& in);

    /// Reads a decimal number as formatted extraction does: 0 where no number stands, the nearest limit where it is
    /// too large, both with the fail state; unchanged where the stream was not good or ended before a field.
    bool readInt(int& value);

    /// Reads a text field: its length and at most that many characters up to white space. @p text is good until the
    /// next operation. False, with the fail state and an unchanged @p text, where the field is not there.
    bool readText(std::string_view& text);

private:
    bool takeReadyInt(int& value);
    bool takeReadyText(int length, std::string_view& text);
    template <class Read>
    bool readFromStream(Read read);

    std::istream& m_in;
    ReadyText m_ready;
    std::string m_memory;
};
