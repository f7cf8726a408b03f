#include "s/RecordReader.h"

#include <algorithm>
#include <istream>

#include "s/RecordField.h"

namespace {

const char* skipSpace(const char* next, const char* end) {
    while (next != end && RecordField::isSpace(*next)) {
        ++next;
    }
    return next;
}

/// The buffer to walk over; none where only the stream's own operations do: it is not good, or it has another stream
/// to flush before each of them.
std::streambuf* walkedBuffer(const std::istream& in) {
    return in.good() && in.tie() == nullptr ? in.rdbuf() : nullptr;
}

}  // namespace

RecordReader::RecordReader(std::istream& in) : m_in(in), m_ready(walkedBuffer(in)) {}

// Most fields lie ready in the stream's buffer together with the character behind them. These take such a field, or
// nothing of any other.

inline bool RecordReader::takeReadyInt(int& value) {
    constexpr std::ptrdiff_t safeDigits = 9;
    const char* next = skipSpace(m_ready.begin(), m_ready.end());
    const bool isNegative = next != m_ready.end() && *next == '-';
    const char* const digits = isNegative ? next + 1 : next;
    const char* const limit = digits + std::min(m_ready.end() - digits, safeDigits);
    int magnitude = 0;
    for (next = digits; next != limit && RecordField::isDigit(*next); ++next) {
        magnitude = magnitude * 10 + (*next - '0');
    }
    if (next == digits || next == m_ready.end() || RecordField::isDigit(*next)) {
        return false;
    }
    value = isNegative ? -magnitude : magnitude;
    m_ready.takeUpTo(next);
    return true;
}

inline bool RecordReader::takeReadyText(int length, std::string_view& text) {
    const char* const begin = skipSpace(m_ready.begin(), m_ready.end());
    const char* const limit = begin + std::min<std::ptrdiff_t>(length, m_ready.end() - begin);
    const char* next = begin;
    while (next != limit && !RecordField::isSpace(*next)) {
        ++next;
    }
    if (next == m_ready.end()) {
        return false;
    }
    text = std::string_view(begin, static_cast<std::size_t>(next - begin));
    m_ready.takeUpTo(next);
    return true;
}

template <class Read>
bool RecordReader::readFromStream(Read read) {
    m_ready.close();
    const bool isRead = read();
    if (m_in.good()) {
        m_ready.open();
    }
    return isRead;
}

bool RecordReader::readInt(int& value) {
    return takeReadyInt(value) || readFromStream([&] { return RecordField::readInt(m_in, value); });
}

bool RecordReader::readText(std::string_view& text) {
    int length = 0;
    if (!readInt(length)) {
        return false;
    }
    if (length < 0) {
        m_ready.close();
        m_in.setstate(std::ios_base::failbit);
        return false;
    }
    if (length == 0) {
        text = "";
        return true;
    }
    if (takeReadyText(length, text)) {
        return true;
    }
    if (!readFromStream([&] { return RecordField::readText(m_in, length, m_memory); })) {
        return false;
    }
    text = m_memory;
    return true;
}
