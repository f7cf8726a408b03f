// Hex and binary text to and from runs of bits in plain arrays. Position p of an array is bit p & 7, least significant
// first, of byte p >> 3.
//
// The loaders follow the usual numbering of a vector of `length` bits: index i is position length - i - 1.
#pragma once

#include <cstddef>
#include <string_view>

#include "s/TextKernels.h"

namespace BitText {

/// A run of bits that is only read.
struct Run {
    const unsigned char* bytes;
    std::size_t first;
    std::size_t count;
};

/// The order in which the bits of a run stand in a text.
enum class Order {
    Rising,  ///< from the first position up
    Falling  ///< from the last position down, as a binary number is read
};

/// How binary text becomes hex text.
enum class Digits {
    OfNumber,  ///< four characters a digit, the first one most significant
    OfBytes    ///< eight characters a byte, the first one least significant; the byte's high digit stands first
};

/// The number of hex digits for so many bits; missing bits count as 0.
constexpr std::size_t hexLength(std::size_t bits, Digits digits) {
    return digits == Digits::OfBytes ? (bits + 7) / 8 * 2 : bits / 4 + (bits % 4 != 0 ? 1 : 0);
}

/// Writes the run as @p run.count characters 0 and 1, without a terminator.
void makeBinary(Run run, Order order, char* text);
/// Writes the run as hexLength() digits of lower case, without a terminator.
void makeHex(Run run, Order order, Digits digits, char* text);

/// Turns characters into bits that fill whole bytes: in rising order from the first byte's lowest bit up, in falling
/// order from the last byte's top bit down. The bits that are left over become 0.
void packText(std::string_view text, BitMark mark, Order order, unsigned char* to);

/// The characters that packHexRepeating() takes at most.
constexpr std::size_t longestAppended = 4096;

bool isHexDigit(char character);

/// Turns characters, at least one, into the bits that appending them gives, four each. A character that is no digit
/// repeats the one before it; @p last is the digit before the text, and then the last one of it.
void packHexRepeating(unsigned char* bytes, std::string_view text, char& last);

/// Which indexes of the vector the text's stream of bits takes.
struct Placement {
    std::size_t size;  ///< the stream keeps its last `size` bits, characters that are no digits counting as four
    bool descending;   ///< from index size - 1 down instead of from index 0 up
};

/// Loads hex text: each digit gives four bits from the most significant on. With @p byteSwap the second character of
/// each pair stands before the first, and a digit gives its bits from the least significant on. Characters that are no
/// digits give no bits. Indexes beyond the array are passed over.
void loadHex(unsigned char* bytes, std::size_t length, std::string_view text, Placement placement, bool byteSwap);
/// Loads binary text: character k, unless it is `0`, sets the k-th index; characters past the size have none. No bit
/// is cleared, and indexes beyond the array are passed over.
void loadBinary(unsigned char* bytes, std::size_t length, std::string_view text, Placement placement);

}  // namespace BitText
