#include "deviceprofile/LogicalLines.h"

#include <cstring>

#include "deviceprofile/Blanks.h"

namespace DeviceProfile {
namespace {

constexpr char byteOrderMark[] = "\xEF\xBB\xBF";
constexpr std::size_t byteOrderMarkSize = sizeof byteOrderMark - 1;

char* find(char* begin, const char* end, char ch) {
    return static_cast<char*>(std::memchr(begin, ch, static_cast<std::size_t>(end - begin)));
}

bool goesOn(const char* begin, const char* end) {
    return begin != end && end[-1] == '\\';
}

}  // namespace

LogicalLines::LogicalLines(char* begin, char* end) : m_position(begin), m_end(end) {
    const bool isMarked = static_cast<std::size_t>(end - begin) >= byteOrderMarkSize &&
                          std::memcmp(begin, byteOrderMark, byteOrderMarkSize) == 0;
    m_position += isMarked ? byteOrderMarkSize : 0;
}

LogicalLines::Piece LogicalLines::takePhysicalLine() {
    Piece piece{m_position, find(m_position, m_end, '\n')};
    if (piece.end != nullptr) {
        m_position = piece.end + 1;
    } else {
        m_position = piece.end = m_end;
    }
    if (piece.end != piece.begin && piece.end[-1] == '\r') {
        --piece.end;
    }
    ++m_number;
    return piece;
}

void LogicalLines::joinContinuation(LogicalLine& line) {
    for (bool open = goesOn(line.begin, line.end); open;) {
        --line.end;
        if (m_position == m_end) {
            line.isCutOff = true;
            return;
        }
        const Piece piece = takePhysicalLine();
        open = goesOn(piece.begin, piece.end);
        char* const text = skipBlanks(piece.begin, piece.end);
        const auto length = static_cast<std::size_t>(piece.end - text);
        std::memmove(line.end, text, length);
        line.end += length;
    }
}

bool LogicalLines::next(LogicalLine& line) {
    while (m_position != m_end) {
        const Piece piece = takePhysicalLine();
        char* const begin = skipBlanks(piece.begin, piece.end);
        if (begin == piece.end || *begin == '#' || *begin == ';') {
            continue;
        }
        line = LogicalLine{begin, piece.end, nullptr, m_number, false};
        line.equals = *begin != '[' ? find(begin, piece.end, '=') : nullptr;
        if (line.equals != nullptr) {
            joinContinuation(line);
        }
        line.end = dropBlanks(begin, line.end);
        *line.end = '\0';
        return true;
    }
    return false;
}

}  // namespace DeviceProfile
