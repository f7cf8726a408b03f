// The text stream form of records, field by field, on the stream's buffer.
//
// The fields are made and read here rather than by the stream's operators: those obey the locale, base and width that
// the caller's stream happens to have, and they cost several times as much.
#pragma once

#include <iosfwd>
#include <string>

/// Gathers the fields of one record, so that the stream sees a single write.
class RecordWriter {
public:
    void addInt(int value);
    /// Null counts as the empty text.
    void addText(const char* text);
    /// The text alone, without its length, and a line feed.
    void addLine(const char* text);
    void writeTo(std::ostream& out) const;

private:
    std::string m_form;
};

/// Reads a decimal number as formatted extraction does: 0 where no number stands, the nearest limit where it is too
/// large, both with the fail state; unchanged where the stream was not good or ended before a field.
bool readRecordInt(std::istream& in, int& value);

/// Reads a text field: its length and at most that many characters up to white space. False, with the fail state and
/// an unchanged @p text, where the field is not there.
bool readRecordText(std::istream& in, std::string& text);
