// The text stream form of records, field by field, read from the stream's buffer; RecordWriter.h writes it.
//
// The fields are made and read here rather than by the stream's operators: those obey the locale, base and width that
// the caller's stream happens to have, and they cost several times as much.
#pragma once

#include <iosfwd>
#include <string>
#include <string_view>

/// Reads a decimal number as formatted extraction does: 0 where no number stands, the nearest limit where it is too
/// large, both with the fail state; unchanged where the stream was not good or ended before a field.
bool readRecordInt(std::istream& in, int& value);

/// Reads a text field: its length and at most that many characters up to white space. @p text lies in @p memory or in
/// the stream's buffer, and is good until either is used again. False, with the fail state and an unchanged @p text,
/// where the field is not there.
bool readRecordText(std::istream& in, std::string& memory, std::string_view& text);
