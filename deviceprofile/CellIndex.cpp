#include "deviceprofile/CellIndex.h"

#include <algorithm>
#include <cstring>

namespace DeviceProfile {
namespace {

/// An index of a row or a field is a 16-bit number.
constexpr std::size_t mostPieces = 32768;

std::size_t findSeparator(std::string_view text, std::size_t from, std::string_view separator) {
    switch (separator.size()) {
        case 0:
            return std::string_view::npos;
        case 1:
            return text.find(separator.front(), from);
        default:
            return text.find(separator, from);
    }
}

/// Calls @p visit with begin and end of each piece of the text between two places, up to the number that has an index.
template <class Visitor>
void forEachPiece(std::string_view text, std::size_t begin, std::size_t end, std::string_view separator,
                  Visitor visit) {
    const std::string_view head = text.substr(0, end);
    for (std::size_t piece = 0; piece < mostPieces; ++piece) {
        const std::size_t pieceEnd = findSeparator(head, begin, separator);
        visit(begin, std::min(pieceEnd, end));
        if (pieceEnd == std::string_view::npos) {
            return;
        }
        begin = pieceEnd + separator.size();
    }
}

}  // namespace

CellIndex::CellIndex(std::string_view value, std::string_view rowSeparator, std::string_view fieldSeparator)
    : m_text(new char[value.size() + 1]) {
    value.copy(m_text.get(), value.size());
    m_text[value.size()] = '\0';
    forEachPiece(value, 0, value.size(), rowSeparator,
                 [&](std::size_t begin, std::size_t end) { addRow(value, begin, end, fieldSeparator); });
    m_rows.push_back(static_cast<std::uint32_t>(m_cells.size()));
}

void CellIndex::addRow(std::string_view value, std::size_t begin, std::size_t end, std::string_view fieldSeparator) {
    m_rows.push_back(static_cast<std::uint32_t>(m_cells.size()));
    forEachPiece(value, begin, end, fieldSeparator, [this](std::size_t cellBegin, std::size_t cellEnd) {
        m_cells.push_back(static_cast<std::uint32_t>(cellBegin));
        m_text[cellEnd] = '\0';
    });
}

}  // namespace DeviceProfile
