// What one byte means in text and in reverse: the tables behind the conversions. They are indexed through unsigned
// char, so that no sign slips in.
#pragma once

#include <array>
#include <cstddef>
#include <cstdint>

namespace ByteTables {

/// What the digit table gives for a character that is no hex digit.
constexpr unsigned char notADigit = 0xFF;

constexpr std::array<unsigned char, 256> makeDigitValues() {
    std::array<unsigned char, 256> table{};
    for (unsigned char& value : table) {
        value = notADigit;
    }
    for (unsigned char digit = 0; digit < 10; ++digit) {
        table['0' + digit] = digit;
    }
    for (unsigned char letter = 0; letter < 6; ++letter) {
        table['a' + letter] = static_cast<unsigned char>(10 + letter);
        table['A' + letter] = static_cast<unsigned char>(10 + letter);
    }
    return table;
}

constexpr std::array<unsigned char, 256> makeMirroredBytes() {
    std::array<unsigned char, 256> table{};
    for (unsigned byte = 0; byte < 256; ++byte) {
        for (unsigned bit = 0; bit < 8; ++bit) {
            table[byte] = static_cast<unsigned char>(table[byte] | ((byte >> bit & 1U) << (7 - bit)));
        }
    }
    return table;
}

constexpr char hexDigits[] = "0123456789abcdef";
constexpr char upperHexDigits[] = "0123456789ABCDEF";

constexpr std::array<std::array<char, 2>, 256> makeHexPairs(const char* digits) {
    std::array<std::array<char, 2>, 256> table{};
    for (unsigned byte = 0; byte < 256; ++byte) {
        table[byte] = {digits[byte >> 4], digits[byte & 15U]};
    }
    return table;
}

constexpr std::array<std::array<char, 8>, 256> makeBitTexts() {
    std::array<std::array<char, 8>, 256> table{};
    for (unsigned byte = 0; byte < 256; ++byte) {
        for (unsigned bit = 0; bit < 8; ++bit) {
            table[byte][bit] = (byte >> bit & 1U) != 0 ? '1' : '0';
        }
    }
    return table;
}

/// Value of a hex digit of either case.
inline constexpr auto digitValue = makeDigitValues();
/// The byte with its bits in reverse order.
inline constexpr auto mirroredByte = makeMirroredBytes();
/// The word with the bits of each of its bytes in reverse order.
constexpr std::uint64_t mirrorEachByte(std::uint64_t word) {
    word = (word >> 1 & 0x5555555555555555U) | (word & 0x5555555555555555U) << 1;
    word = (word >> 2 & 0x3333333333333333U) | (word & 0x3333333333333333U) << 2;
    return (word >> 4 & 0x0F0F0F0F0F0F0F0FU) | (word & 0x0F0F0F0F0F0F0F0FU) << 4;
}
/// The byte as two hex digits, the high one first.
inline constexpr auto hexPair = makeHexPairs(hexDigits);
/// The same in upper case.
inline constexpr auto upperHexPair = makeHexPairs(upperHexDigits);
/// The byte as eight characters 0 and 1, the least significant bit first.
inline constexpr auto bitText = makeBitTexts();

/// Value of the character as a hex digit, or notADigit.
constexpr unsigned char valueOf(char digit) {
    return digitValue[static_cast<unsigned char>(digit)];
}

}  // namespace ByteTables
