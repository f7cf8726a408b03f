// Operations on runs of bits in byte arrays: the only place of the library that works with masks.
//
// Position p of an array is bit p & 7, least significant first, of byte p >> 3. A run is a first position and a count.
// No operation reads or writes a byte that holds no bit of its runs, and bits beside a run keep their value.
#pragma once

#include <cstddef>
#include <cstdint>
#include <cstring>

namespace BitKernels {

using Word = std::uint64_t;
constexpr std::size_t wordBits = 64;

static_assert(__BYTE_ORDER__ == __ORDER_LITTLE_ENDIAN__, "a word's low byte is the first one in memory");

/// The lowest @p count bits set; at most 64.
constexpr Word lowMask(std::size_t count) {
    return count < wordBits ? (Word{1} << count) - 1 : ~Word{0};
}

inline Word loadWord(const unsigned char* bytes) {
    Word word = 0;
    std::memcpy(&word, bytes, sizeof word);
    return word;
}
inline void storeWord(unsigned char* bytes, Word word) {
    std::memcpy(bytes, &word, sizeof word);
}

/// At most 64 bits as a number, the first one least significant.
Word readBits(const unsigned char* bytes, std::size_t first, std::size_t count);
/// Writes the low @p count bits of the value, at most 64, the least significant first.
void writeBits(unsigned char* bytes, std::size_t first, std::size_t count, Word value);

/// Copies a run; the two may lie in the same array and overlap, and the target becomes what the source was.
void copyBits(unsigned char* target, std::size_t targetFirst, const unsigned char* source, std::size_t sourceFirst,
              std::size_t count);
/// Gives all bits of a run one value.
void fillBits(unsigned char* bytes, std::size_t first, std::size_t count, bool value);
/// True when the same run holds the same bits in both arrays.
bool equalBits(const unsigned char* a, const unsigned char* b, std::size_t first, std::size_t count);
/// The first position in the run that holds the value; first + count when there is none.
std::size_t findBit(const unsigned char* bytes, std::size_t first, std::size_t count, bool value);
/// The number of ones in a run.
std::size_t countOnes(const unsigned char* bytes, std::size_t first, std::size_t count);
/// A number that depends on the bits of the run alone, wherever it lies.
std::size_t hashBits(const unsigned char* bytes, std::size_t first, std::size_t count);

// Whole bytes. Target and source may be the same array, but must not overlap otherwise.

void andBytes(unsigned char* target, const unsigned char* source, std::size_t count);
void orBytes(unsigned char* target, const unsigned char* source, std::size_t count);
void xorBytes(unsigned char* target, const unsigned char* source, std::size_t count);
void complementBytes(unsigned char* target, const unsigned char* source, std::size_t count);
/// Turns the low @p count bits of the value round, at most 64; the others become 0.
Word reverseBits(Word value, std::size_t count);

}  // namespace BitKernels
