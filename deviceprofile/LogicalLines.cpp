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

/// A physical line, without its end.
struct Piece {
    char* begin;
    char* end;
    char* next;  ///< begin of the next one
};

Piece pieceAt(char* begin, char* textEnd) {
    char* const lineFeed = find(begin, textEnd, '\n');
    char* const end = lineFeed != nullptr ? lineFeed : textEnd;
    const bool hasReturn = end != begin && end[-1] == '\r';
    return {begin, end - (hasReturn ? 1 : 0), lineFeed != nullptr ? lineFeed + 1 : textEnd};
}

bool goesOn(const char* begin, const char* end) {
    return begin != end && end[-1] == '\\';
}

/// Sets a zero behind the last character that is not blank, and gives its place.
char* terminate(const char* begin, char* end) {
    end = dropBlanks(begin, end);
    *end = '\0';
    return end;
}

}  // namespace

char* joinPieces(char* begin, char* end) {
    char* joined = begin;
    for (char* position = begin; position != end;) {
        const Piece piece = pieceAt(position, end);
        const bool open = goesOn(piece.begin, piece.end);
        char* const text = skipBlanks(piece.begin, piece.end);
        const auto length = static_cast<std::size_t>(piece.end - text) - (open ? 1 : 0);
        std::memmove(joined, text, length);
        joined += length;
        position = piece.next;
    }
    return terminate(begin, joined);
}

LogicalLines::LogicalLines(char* begin, char* end) : m_position(begin), m_end(end) {
    const bool isMarked = static_cast<std::size_t>(end - begin) >= byteOrderMarkSize &&
                          std::memcmp(begin, byteOrderMark, byteOrderMarkSize) == 0;
    m_position += isMarked ? byteOrderMarkSize : 0;
}

void LogicalLines::findLastPiece(LogicalLine& line) {
    // In locals, for what is read through a pointer to characters could be any member.
    char* position = m_position;
    std::uint32_t number = m_number;
    bool open = goesOn(line.begin, line.end);
    line.isContinued = open;
    while (open && position != m_end) {
        const Piece piece = pieceAt(position, m_end);
        open = goesOn(piece.begin, piece.end);
        position = piece.next;
        ++number;
    }
    line.isCutOff = open;
    m_position = position;
    m_number = number;
}

bool LogicalLines::next(LogicalLine& line) {
    while (m_position != m_end) {
        const Piece piece = pieceAt(m_position, m_end);
        m_position = piece.next;
        ++m_number;
        char* const begin = skipBlanks(piece.begin, piece.end);
        if (begin == piece.end || *begin == '#' || *begin == ';') {
            continue;
        }
        line = LogicalLine{begin, piece.end, nullptr, m_number, false, false};
        line.equals = *begin != '[' ? find(begin, piece.end, '=') : nullptr;
        if (line.equals != nullptr) {
            findLastPiece(line);
        }
        line.end = line.isContinued ? m_position : terminate(begin, line.end);
        return true;
    }
    return false;
}

}  // namespace DeviceProfile
