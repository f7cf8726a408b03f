#include "BitView.h"

#include <algorithm>
#include <array>
#include <cstdio>
#include <utility>

#include "s/BitKernels.h"

namespace {

/// The beginning of a line: a position, right-aligned.
std::string lineHead(std::size_t position) {
    std::array<char, 32> text{};
    std::snprintf(text.data(), text.size(), "%8llu  ", static_cast<unsigned long long>(position));
    return text.data();
}

/// The bits of the index order with a separator before each index of which @p toGo is a multiple of the group.
template <class Vector, class ToGo>
std::string groupedText(const Vector& vector, std::size_t group, char separator, ToGo toGo) {
    std::string text;
    for (std::size_t i = 0; i < vector.length(); ++i) {
        if (group != 0 && i != 0 && toGo(i) % group == 0) {
            text += separator;
        }
        text += vector.testBit(i) ? '1' : '0';
    }
    return text;
}

char bitOf(const LRBitVec& vector, std::size_t position) {
    if (position >= vector.length()) {
        return '-';
    }
    return vector.testBit(position) ? '1' : '0';
}

}  // namespace

std::string toGroupedText(const LRBitVec& vector, std::size_t group, char separator) {
    return groupedText(vector, group, separator, [](std::size_t index) { return index; });
}

std::string toGroupedText(const RLBitVec& vector, std::size_t group, char separator) {
    return groupedText(vector, group, separator, [&](std::size_t index) { return vector.length() - index; });
}

std::string hexDump(const LRBitVec& vector) {
    constexpr std::size_t bitsPerLine = 128;
    std::string text;
    for (std::size_t position = 0; position < vector.length(); position += 8) {
        if (position % bitsPerLine == 0) {
            text += (position != 0 ? "\n" : "") + lineHead(position);
        } else {
            text += ' ';
        }
        const auto byte = static_cast<unsigned>(
            BitKernels::readBits(vector.data(), position, std::min<std::size_t>(8, vector.length() - position)));
        text += "0123456789abcdef"[byte >> 4];
        text += "0123456789abcdef"[byte & 15];
    }
    return text.empty() ? text : text + '\n';
}

std::string difference(const LRBitVec& a, const LRBitVec& b) {
    constexpr std::size_t bitsPerLine = 64;
    const std::size_t common = std::min(a.length(), b.length());
    const std::size_t longest = std::max(a.length(), b.length());
    std::size_t differing = 0;
    std::string lines;
    for (std::size_t begin = 0; begin < longest; begin += bitsPerLine) {
        const std::size_t end = std::min(begin + bitsPerLine, longest);
        if (end <= common && BitKernels::equalBits(a.data(), b.data(), begin, end - begin)) {
            continue;
        }
        std::string left;
        std::string right;
        std::string marks;
        for (std::size_t position = begin; position < end; ++position) {
            left += bitOf(a, position);
            right += bitOf(b, position);
            marks += left.back() == right.back() ? ' ' : '^';
        }
        differing += static_cast<std::size_t>(std::count(marks.begin(), marks.end(), '^'));
        marks.erase(marks.find_last_of('^') + 1);
        const std::string head = lineHead(begin);
        const std::string indent(head.size(), ' ');
        for (const auto& [start, text] : {std::pair(&head, &left), {&indent, &right}, {&indent, &marks}}) {
            lines.append(*start).append(*text).append("\n");
        }
    }
    if (differing == 0) {
        return {};
    }
    return std::to_string(differing) + " of " + std::to_string(longest) + " bits differ\n" + lines;
}
