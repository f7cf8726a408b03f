// What the writers of record formats share: rows of data, and digits.
#pragma once

#include <algorithm>
#include <cstring>
#include <vector>

#include "imagetools/SegmentMap.h"
#include "s/ByteTables.h"

namespace ImageTools {

/// Data bytes of a record. Rows end at multiples of it, so none crosses a border of 64 KiB.
constexpr std::size_t rowSize = 16;

/// Calls take(row) for each row of the pieces.
template <class Take>
void forEachRow(const std::vector<Segment>& pieces, Take take) {
    for (const Segment& piece : pieces) {
        for (std::uint64_t first = piece.address; first < piece.end();) {
            const std::uint64_t last = std::min(piece.end(), (first / rowSize + 1) * rowSize);
            take(piece.part(first, last));
            first = last;
        }
    }
}

/// Writes two upper-case digits; gives the place behind them.
inline char* putByte(char* to, unsigned byte) {
    std::memcpy(to, ByteTables::upperHexPair[byte & 0xFFU].data(), 2);
    return to + 2;
}

/// Writes a number of @p bytes bytes, the most significant first, and adds them to the sum.
inline char* putNumber(char* to, std::uint64_t number, unsigned bytes, unsigned& sum) {
    while (bytes-- > 0) {
        const auto byte = static_cast<unsigned>(number >> (8 * bytes) & 0xFFU);
        sum += byte;
        to = putByte(to, byte);
    }
    return to;
}

/// Writes the bytes of a row and adds them to the sum.
inline char* putData(char* to, const unsigned char* data, std::size_t size, unsigned& sum) {
    for (std::size_t i = 0; i < size; ++i) {
        sum += data[i];
        to = putByte(to, data[i]);
    }
    return to;
}

/// The same for a whole row, in steps that compilers turn into vector instructions.
inline char* putWholeRow(char* to, const unsigned char* data, unsigned& sum) {
    unsigned char digits[2 * rowSize];
    unsigned rowSum = 0;
    for (std::size_t i = 0; i < rowSize; ++i) {
        digits[2 * i] = data[i] >> 4;
        digits[2 * i + 1] = data[i] & 0xFU;
        rowSum += data[i];
    }
    for (unsigned char& digit : digits) {
        constexpr unsigned char toDigit = '0';
        constexpr unsigned char toLetter = 'A' - 10;
        digit = static_cast<unsigned char>(digit + (digit < 10 ? toDigit : toLetter));
    }
    std::memcpy(to, digits, sizeof digits);
    sum += rowSum;
    return to + sizeof digits;
}

inline char* putRow(char* to, const Segment& row, unsigned& sum) {
    return row.size == rowSize ? putWholeRow(to, row.data, sum) : putData(to, row.data, row.size, sum);
}

}  // namespace ImageTools
