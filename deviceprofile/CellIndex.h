// A value split into rows and fields, once, so that each cell is found by two look-ups.
#pragma once

#include <cstdint>
#include <memory>
#include <string_view>
#include <vector>

namespace DeviceProfile {

/// A copy of a value with a zero behind each cell, and the place of each cell in it.
///
/// Rows and fields are numbered from 0 to 32767; what lies behind is not indexed.
class CellIndex {
public:
    /// A separator that is empty does not split.
    CellIndex(std::string_view value, std::string_view rowSeparator, std::string_view fieldSeparator);

    /// The text of a cell, or null when there is no such row or field.
    const char* at(int row, int field) const {
        if (row < 0 || static_cast<std::size_t>(row) + 1 >= m_rows.size() || field < 0) {
            return nullptr;
        }
        const std::uint32_t first = m_rows[static_cast<std::size_t>(row)];
        const std::uint32_t count = m_rows[static_cast<std::size_t>(row) + 1] - first;
        const auto wanted = static_cast<std::uint32_t>(field);
        return wanted < count ? m_text.get() + m_cells[first + wanted] : nullptr;
    }

private:
    void addRow(std::string_view value, std::size_t begin, std::size_t end, std::string_view fieldSeparator);

    std::unique_ptr<char[]> m_text;
    std::vector<std::uint32_t> m_cells;  ///< start of each cell in the text, row by row
    std::vector<std::uint32_t> m_rows;   ///< first cell of each row, then the number of cells
};

}  // namespace DeviceProfile
