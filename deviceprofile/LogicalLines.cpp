#include "deviceprofile/LogicalLines.h"

#include <cstddef>
#include <cstring>
#include <limits>

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
    char* lineFeed;  ///< or the end of the text
    char* next;      ///< begin of the next one
};

Piece pieceAt(char* begin, char* textEnd) {
    char* const lineFeed = find(begin, textEnd, '\n');
    char* const end = lineFeed != nullptr ? lineFeed : textEnd;
    const bool hasReturn = end != begin && end[-1] == '\r';
    return {begin, end - (hasReturn ? 1 : 0), end, lineFeed != nullptr ? lineFeed + 1 : textEnd};
}

/// Whether the physical line goes on that ends here. It has a `=`, or stands behind one that has.
bool goesOn(const char* lineFeed) {
    return lineFeed[-1] == '\\' || (lineFeed[-1] == '\r' && lineFeed[-2] == '\\');
}

constexpr std::ptrdiff_t blockSize = 128;

using Count = unsigned char;
static_assert(blockSize <= std::numeric_limits<Count>::max());

/// The lines that end in a block, and how many of them do not go on.
struct LineEnds {
    Count all;
    Count last;
};

/// Written without branches, so that many bytes are looked at at once.
LineEnds lineEndsIn(const char* block) {
    const auto is = [block](std::ptrdiff_t at, char ch) -> Count { return block[at] == ch ? 1 : 0; };
    LineEnds ends{};
    for (std::ptrdiff_t i = 0; i < blockSize; ++i) {
        const Count isEnd = is(i, '\n');
        const Count isOpen = is(i - 1, '\\') | (is(i - 1, '\r') & is(i - 2, '\\'));
        ends.all = static_cast<Count>(ends.all + isEnd);
        ends.last = static_cast<Count>(ends.last + (isEnd & (isOpen ^ 1)));
    }
    return ends;
}

/// Sets a zero behind the last character that is not blank, and gives its place.
char* terminate(const char* begin, char* end) {
    end = dropBlanks(begin, end);
    *end = '\0';
    return end;
}

}  // namespace

char* joinPieces(char* begin, char* lineEnd) {
    char* joined = begin;
    for (char* position = begin; position != lineEnd;) {
        const Piece piece = pieceAt(position, lineEnd);
        char* const end = piece.end - (goesOn(piece.lineFeed) ? 1 : 0);
        char* const text = skipBlanks(piece.begin, end);
        const auto length = static_cast<std::size_t>(end - text);
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
    bool open = true;
    while (m_end - position > blockSize) {
        const LineEnds ends = lineEndsIn(position);
        if (ends.last != 0) {
            break;
        }
        position += blockSize;
        number += ends.all;
    }
    while (open && position != m_end) {
        const Piece piece = pieceAt(position, m_end);
        open = goesOn(piece.lineFeed);
        position = piece.next;
        ++number;
    }
    line.isCutOff = open;
    line.end = position;
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
        line.isContinued = line.equals != nullptr && goesOn(piece.lineFeed);
        if (line.isContinued) {
            findLastPiece(line);
        } else {
            line.end = terminate(begin, line.end);
        }
        return true;
    }
    return false;
}

}  // namespace DeviceProfile
