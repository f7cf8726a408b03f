#include "s/RecordField.h"

#include <cstdint>
#include <istream>
#include <limits>

namespace RecordField {
namespace {

bool isEnd(Character c) {
    return c == std::char_traits<char>::eof();
}

/// Skips white space. False, with end and fail state, where nothing follows it or the stream was not good.
bool openField(std::istream& in) {
    const std::istream::sentry ready(in, true);
    if (!ready) {
        return false;
    }
    std::streambuf& buffer = *in.rdbuf();
    Character c = buffer.sgetc();
    while (isSpace(c)) {
        c = buffer.snextc();
    }
    if (isEnd(c)) {
        in.setstate(std::ios_base::eofbit | std::ios_base::failbit);
        return false;
    }
    return true;
}

bool limitTo32Bits(std::int64_t wide, int& value) {
    constexpr std::int64_t least = std::numeric_limits<int>::min();
    constexpr std::int64_t most = std::numeric_limits<int>::max();
    value = static_cast<int>(wide < least ? least : wide > most ? most : wide);
    return wide >= least && wide <= most;
}

/// Takes the digits at the front; false where there are none.
bool takeDigits(std::streambuf& buffer, std::int64_t& magnitude) {
    constexpr std::int64_t beyond32Bits = std::int64_t{1} << 40;
    bool any = false;
    Character c = buffer.sgetc();
    for (; isDigit(c); c = buffer.snextc()) {
        any = true;
        magnitude = magnitude < beyond32Bits ? magnitude * 10 + (c - '0') : magnitude;
    }
    return any;
}

}  // namespace

bool readInt(std::istream& in, int& value) {
    if (!openField(in)) {
        return false;
    }
    std::streambuf& buffer = *in.rdbuf();
    const Character sign = buffer.sgetc();
    if (sign == '-' || sign == '+') {
        buffer.sbumpc();
    }
    std::int64_t magnitude = 0;
    const bool any = takeDigits(buffer, magnitude);
    const bool fits = limitTo32Bits(sign == '-' ? -magnitude : magnitude, value);
    in.setstate((isEnd(buffer.sgetc()) ? std::ios_base::eofbit : std::ios_base::goodbit) |
                (any && fits ? std::ios_base::goodbit : std::ios_base::failbit));
    return any && fits;
}

bool readText(std::istream& in, int length, std::string& text) {
    if (!openField(in)) {
        return false;
    }
    text.clear();
    std::streambuf& buffer = *in.rdbuf();
    Character c = buffer.sgetc();
    for (int taken = 0; taken < length && !isEnd(c) && !isSpace(c); ++taken) {
        text.push_back(std::char_traits<char>::to_char_type(c));
        c = buffer.snextc();
    }
    if (isEnd(c)) {
        in.setstate(std::ios_base::eofbit);
    }
    return true;
}

}  // namespace RecordField
