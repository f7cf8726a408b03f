// Fields of records, read from any stream character by character.
#pragma once

#include <iosfwd>
#include <string>

namespace RecordField {

using Character = std::char_traits<char>::int_type;

constexpr bool isSpace(Character c) {
    return c == ' ' || (c >= '\t' && c <= '\r');
}

constexpr bool isDigit(Character c) {
    return c >= '0' && c <= '9';
}

/// As RecordReader::readInt().
bool readInt(std::istream& in, int& value);

/// Reads the characters of a text field, behind its length, which is above 0.
bool readText(std::istream& in, int length, std::string& text);

}  // namespace RecordField
