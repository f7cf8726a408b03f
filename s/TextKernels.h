// The inner loops between text and bytes, on whole bytes of plain arrays.
//
// There is a portable form and one for processors with 32-byte vectors; both do the same, and the tests run both.
// "Least significant bit first" is the order of bits in a vector's bytes.
#pragma once

#include <cstddef>

/// How the bytes of hex text map to the bytes of an array, beside the plain form, in which they stand in text order.
struct ByteOrder {
    bool lastByteFirst;  ///< the last byte of the array stands first in the text
    bool mirrorBits;     ///< the bits of each byte are reversed
};

/// Which characters of binary text count as 1.
enum class BitMark { OnlyOne, AllButZero };

struct TextKernels {
    /// Reverses the bits of each byte; @p to may be @p from.
    void (*mirrorBytes)(const unsigned char* from, std::size_t count, unsigned char* to);
    /// Turns 2 * @p count hex digits into bytes. False when a character is no digit; the bytes are worthless then.
    bool (*decodeHex)(const char* text, std::size_t count, ByteOrder order, unsigned char* to);
    /// Turns bytes into 2 * @p count hex digits of lower case.
    void (*encodeHex)(const unsigned char* from, std::size_t count, ByteOrder order, char* text);
    /// Turns 8 * @p count characters into bits, from the lowest bit of the first byte up, or the other way.
    void (*packBits)(const char* text, std::size_t count, BitMark mark, bool lastBitFirst, unsigned char* to);
    /// Turns bytes into 8 * @p count characters 0 and 1, from the lowest bit of the first byte up, or the other way.
    void (*unpackBits)(const unsigned char* from, std::size_t count, bool lastBitFirst, char* text);
};

/// The fastest form that this processor runs.
const TextKernels& textKernels();

const TextKernels& portableTextKernels();
/// The form with 32-byte vectors; null where the build or the processor has none.
const TextKernels* wideTextKernels();
