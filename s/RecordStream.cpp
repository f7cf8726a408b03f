#include "s/RecordStream.h"

#include <charconv>
#include <cstdint>
#include <istream>
#include <limits>
#include <ostream>
#include <string_view>

#include "HkStr.h"

namespace {

using Traits = std::char_traits<char>;

bool isEnd(Traits::int_type c) {
    return Traits::eq_int_type(c, Traits::eof());
}

bool isSpace(Traits::int_type c) {
    return c == ' ' || (c >= '\t' && c <= '\r');
}

/// Skips white space. False, with end and fail state, where nothing follows it or the stream was not good.
bool openField(std::istream& in) {
    const std::istream::sentry ready(in, true);
    if (!ready) {
        return false;
    }
    std::streambuf& buffer = *in.rdbuf();
    Traits::int_type c = buffer.sgetc();
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
    Traits::int_type c = buffer.sgetc();
    for (; HkStr::IsDigit(c) != 0; c = buffer.snextc()) {
        any = true;
        magnitude = magnitude < beyond32Bits ? magnitude * 10 + (c - '0') : magnitude;
    }
    return any;
}

}  // namespace

void RecordWriter::addInt(int value) {
    char digits[16];
    const std::to_chars_result end = std::to_chars(digits, digits + sizeof digits, value);
    *end.ptr = '\n';
    m_form.append(digits, end.ptr + 1);
}

void RecordWriter::addText(const char* text) {
    const std::string_view view(text != nullptr ? text : "");
    addInt(static_cast<int>(view.size()));
    addLine(view.data());
}

void RecordWriter::addLine(const char* text) {
    m_form.append(text);
    m_form.push_back('\n');
}

void RecordWriter::writeTo(std::ostream& out) const {
    out.write(m_form.data(), static_cast<std::streamsize>(m_form.size()));
    out.width(0);
}

bool readRecordInt(std::istream& in, int& value) {
    if (!openField(in)) {
        return false;
    }
    std::streambuf& buffer = *in.rdbuf();
    const Traits::int_type sign = buffer.sgetc();
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

bool readRecordText(std::istream& in, std::string& text) {
    int length = 0;
    if (!readRecordInt(in, length)) {
        return false;
    }
    if (length < 0) {
        in.setstate(std::ios_base::failbit);
        return false;
    }
    if (length == 0) {
        text.clear();
        return true;
    }
    if (!openField(in)) {
        return false;
    }
    text.clear();
    std::streambuf& buffer = *in.rdbuf();
    Traits::int_type c = buffer.sgetc();
    for (int taken = 0; taken < length && !isEnd(c) && !isSpace(c); ++taken) {
        text.push_back(Traits::to_char_type(c));
        c = buffer.snextc();
    }
    if (isEnd(c)) {
        in.setstate(std::ios_base::eofbit);
    }
    return true;
}
