#include "s/RecordStream.h"

#include <algorithm>
#include <istream>

#include "s/ReadyText.h"
#include "s/RecordField.h"

namespace {

const char* skipSpace(const char* next, const char* end) {
    while (next != end && RecordField::isSpace(*next)) {
        ++next;
    }
    return next;
}

// Most fields lie ready in the stream's buffer together with the character behind them. These take such a field, or
// nothing of any other.

bool takeReadyInt(std::streambuf& buffer, int& value) {
    constexpr std::ptrdiff_t safeDigits = 9;
    const ReadyText ready(buffer);
    const char* next = skipSpace(ready.begin(), ready.end());
    const bool isNegative = next != ready.end() && *next == '-';
    const char* const digits = isNegative ? next + 1 : next;
    const char* const limit = digits + std::min(ready.end() - digits, safeDigits);
    int magnitude = 0;
    for (next = digits; next != limit && RecordField::isDigit(*next); ++next) {
        magnitude = magnitude * 10 + (*next - '0');
    }
    if (next == digits || next == ready.end() || RecordField::isDigit(*next)) {
        return false;
    }
    value = isNegative ? -magnitude : magnitude;
    ready.takeUpTo(next);
    return true;
}

bool takeReadyText(std::streambuf& buffer, int length, std::string_view& text) {
    const ReadyText ready(buffer);
    const char* const begin = skipSpace(ready.begin(), ready.end());
    const char* const limit = begin + std::min<std::ptrdiff_t>(length, ready.end() - begin);
    const char* next = begin;
    while (next != limit && !RecordField::isSpace(*next)) {
        ++next;
    }
    if (next == ready.end()) {
        return false;
    }
    text = std::string_view(begin, static_cast<std::size_t>(next - begin));
    ready.takeUpTo(next);
    return true;
}

}  // namespace

bool readRecordInt(std::istream& in, int& value) {
    return (in.good() && in.tie() == nullptr && takeReadyInt(*in.rdbuf(), value)) || RecordField::readInt(in, value);
}

bool readRecordText(std::istream& in, std::string& memory, std::string_view& text) {
    int length = 0;
    if (!readRecordInt(in, length)) {
        return false;
    }
    if (length < 0) {
        in.setstate(std::ios_base::failbit);
        return false;
    }
    if (length == 0) {
        text = "";
        return true;
    }
    if (in.good() && takeReadyText(*in.rdbuf(), length, text)) {
        return true;
    }
    if (!RecordField::readText(in, length, memory)) {
        return false;
    }
    text = memory;
    return true;
}
