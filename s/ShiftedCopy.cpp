// The source run begins `shift` bits, 1 to 7, into its first byte, so a target unit at offset i is
// source[i] >> shift | source[i + 1] << (8 - shift), whatever the unit's width.

#include "s/ShiftedCopy.h"

#include <cstring>

#include "s/BitKernels.h"
#include "s/WideVectors.h"

namespace BitKernels {
namespace {

TESSAL_INLINE_BODY Word shiftedWord(const unsigned char* source, unsigned shift) {
    return loadWord(source) >> shift | loadWord(source + 1) << (8 - shift);
}

TESSAL_INLINE_BODY unsigned char shiftedByte(const unsigned char* source, unsigned shift) {
    return static_cast<unsigned char>(source[0] >> shift | source[1] << (8 - shift));
}

/// One block; all of it is read before any of it is written.
template <class Block>
TESSAL_INLINE_BODY void copyShiftedBlock(unsigned char* target, const unsigned char* source, unsigned shift) {
    Block low;
    Block high;
    loadBlock(low, source);
    loadBlock(high, source + 1);
    low = low >> shift | high << (8 - shift);
    storeBlock(target, low);
}

template <class Block>
TESSAL_INLINE_BODY void copyUpwards(unsigned char* target, const unsigned char* source, std::size_t count,
                                    unsigned shift) {
    std::size_t i = 0;
    for (; i + sizeof(Block) <= count; i += sizeof(Block)) {
        copyShiftedBlock<Block>(target + i, source + i, shift);
    }
    for (; i + sizeof(Word) <= count; i += sizeof(Word)) {
        storeWord(target + i, shiftedWord(source + i, shift));
    }
    for (; i < count; ++i) {
        target[i] = shiftedByte(source + i, shift);
    }
}

template <class Block>
TESSAL_INLINE_BODY void copyDownwards(unsigned char* target, const unsigned char* source, std::size_t count,
                                      unsigned shift) {
    std::size_t i = count;
    for (; i >= sizeof(Block); i -= sizeof(Block)) {
        copyShiftedBlock<Block>(target + i - sizeof(Block), source + i - sizeof(Block), shift);
    }
    for (; i >= sizeof(Word); i -= sizeof(Word)) {
        storeWord(target + i - sizeof(Word), shiftedWord(source + i - sizeof(Word), shift));
    }
    for (; i > 0; --i) {
        target[i - 1] = shiftedByte(source + i - 1, shift);
    }
}

TESSAL_WIDE void copyUpwardsWide(unsigned char* target, const unsigned char* source, std::size_t count,
                                 unsigned shift) {
    copyUpwards<WideBlock>(target, source, count, shift);
}

TESSAL_WIDE void copyDownwardsWide(unsigned char* target, const unsigned char* source, std::size_t count,
                                   unsigned shift) {
    copyDownwards<WideBlock>(target, source, count, shift);
}

#if TESSAL_HAS_WIDE

// ---- By cache lines: each line of the source is loaded once, and what a line of the target needs is picked from two
// ---- neighbours by permutations of bytes. A block's loads above mostly lie across two lines, which costs twice.

constexpr std::size_t lineSize = 64;
using LineBlock = std::uint64_t __attribute__((vector_size(lineSize)));

std::size_t offsetInLine(const unsigned char* bytes) {
    return reinterpret_cast<std::uintptr_t>(bytes) % lineSize;
}

/// For each byte of a target line its place in two lines of the source, the first one's @p offset is the run's.
TESSAL_PERMUTING inline __m512i placesFrom(std::size_t offset) {
    unsigned char places[lineSize];
    for (std::size_t i = 0; i < lineSize; ++i) {
        places[i] = static_cast<unsigned char>(offset + i);
    }
    return _mm512_loadu_si512(places);
}

TESSAL_PERMUTING TESSAL_INLINE_BODY __m512i pickLine(__m512i line, __m512i next, __m512i places, unsigned shift) {
    const __m512i nextPlaces = _mm512_add_epi8(places, _mm512_set1_epi8(1));
    const auto low = LineBlock(_mm512_permutex2var_epi8(line, places, next));
    const auto high = LineBlock(_mm512_permutex2var_epi8(line, nextPlaces, next));
    return __m512i(low >> shift | high << (8 - shift));
}

TESSAL_PERMUTING void copyUpwardsByLines(unsigned char* target, const unsigned char* source, std::size_t count,
                                         unsigned shift) {
    // Here the target is at the begin of a line, and the line that the source is in begins inside the run.
    std::size_t i = 2 * lineSize - offsetInLine(target);
    copyUpwards<WideBlock>(target, source, i, shift);
    const std::size_t offset = offsetInLine(source + i);
    const __m512i places = placesFrom(offset);
    __m512i line = _mm512_load_si512(source + i - offset);
    for (; i + 2 * lineSize <= count; i += lineSize) {
        const __m512i next = _mm512_load_si512(source + i - offset + lineSize);
        _mm512_store_si512(target + i, pickLine(line, next, places, shift));
        line = next;
    }
    copyUpwards<WideBlock>(target + i, source + i, count - i, shift);
}

TESSAL_PERMUTING void copyDownwardsByLines(unsigned char* target, const unsigned char* source, std::size_t count,
                                           unsigned shift) {
    // Here the target is at the end of a line, and the line that the source is in ends inside the run.
    std::size_t i = count - lineSize - offsetInLine(target + count);
    copyDownwards<WideBlock>(target + i, source + i, count - i, shift);
    const std::size_t offset = offsetInLine(source + i);
    const __m512i places = placesFrom(offset);
    __m512i next = _mm512_load_si512(source + i - offset);
    while (i >= 2 * lineSize) {
        i -= lineSize;
        const __m512i line = _mm512_load_si512(source + i - offset);
        _mm512_store_si512(target + i, pickLine(line, next, places, shift));
        next = line;
    }
    copyDownwards<WideBlock>(target, source, i, shift);
}

bool goesByLines(std::size_t count) {
    constexpr std::size_t worthItsBeginAndEnd = 8 * lineSize;
    return count >= worthItsBeginAndEnd && hasBytePermutations();
}

#endif

void copyShiftedUpwards(unsigned char* target, const unsigned char* source, std::size_t count, unsigned shift) {
#if TESSAL_HAS_WIDE
    if (goesByLines(count)) {
        copyUpwardsByLines(target, source, count, shift);
        return;
    }
#endif
    if (hasWideVectors()) {
        copyUpwardsWide(target, source, count, shift);
    } else {
        copyUpwards<NarrowBlock>(target, source, count, shift);
    }
}

void copyShiftedDownwards(unsigned char* target, const unsigned char* source, std::size_t count, unsigned shift) {
#if TESSAL_HAS_WIDE
    if (goesByLines(count)) {
        copyDownwardsByLines(target, source, count, shift);
        return;
    }
#endif
    if (hasWideVectors()) {
        copyDownwardsWide(target, source, count, shift);
    } else {
        copyDownwards<NarrowBlock>(target, source, count, shift);
    }
}

/// Copies bytes that begin at a bit of the source, by @p copyShifted where that bit is not a byte's first.
template <class Copy>
void copyWholeBytes(unsigned char* target, const unsigned char* source, std::size_t sourceFirst, std::size_t count,
                    Copy copyShifted) {
    const auto shift = static_cast<unsigned>(sourceFirst & 7);
    source += sourceFirst >> 3;
    if (count == 0) {
        return;
    }
    if (shift == 0) {
        std::memmove(target, source, count);
    } else {
        copyShifted(target, source, count, shift);
    }
}

}  // namespace

void copyBytesFromLowEnd(unsigned char* target, const unsigned char* source, std::size_t sourceFirst,
                         std::size_t count) {
    copyWholeBytes(target, source, sourceFirst, count, copyShiftedUpwards);
}

void copyBytesFromHighEnd(unsigned char* target, const unsigned char* source, std::size_t sourceFirst,
                          std::size_t count) {
    copyWholeBytes(target, source, sourceFirst, count, copyShiftedDownwards);
}

}  // namespace BitKernels
