// Hex text to bytes, at the speed of memory.
#pragma once

#include <array>
#include <cstddef>

namespace HexDigits {

constexpr unsigned char noDigit = 0xFF;

/// The value of each character as a hex digit of either case, noDigit for all others.
extern const std::array<unsigned char, 256> values;

inline unsigned char valueOf(char character) {
    return values[static_cast<unsigned char>(character)];
}

/// Turns pairs of digits into bytes, the first digit of a pair into the high half, up to the first character that is
/// no digit or the last whole pair.
/// @param bytes takes count / 2 bytes; what lies behind the decoded ones may be overwritten
/// @returns the number of characters decoded, always even
std::size_t decodePairs(unsigned char* bytes, const char* text, std::size_t count);

}  // namespace HexDigits
