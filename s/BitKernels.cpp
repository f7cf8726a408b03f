#include "s/BitKernels.h"

#include <functional>

#include "s/ByteTables.h"
#include "s/ShiftedCopy.h"
#include "s/WideVectors.h"

namespace BitKernels {

namespace {

/// A run taken apart: bits in a first byte that is not whole, whole bytes, bits in a last byte that is not whole. A
/// run inside one byte that does not reach the byte's end has a first part only.
struct Run {
    Run(std::size_t first, std::size_t count) {
        const std::size_t skipped = first & 7;
        if (skipped != 0) {
            headBits = count < 8 - skipped ? count : 8 - skipped;
            headMask = static_cast<unsigned char>(lowMask(headBits) << skipped);
        }
        headByte = first >> 3;
        firstWhole = (first + 7) >> 3;
        wholeBytes = (count - headBits) >> 3;
        tailByte = firstWhole + wholeBytes;
        tailBits = (count - headBits) & 7;
        tailMask = static_cast<unsigned char>(lowMask(tailBits));
    }

    std::size_t headByte = 0;
    std::size_t headBits = 0;
    std::size_t firstWhole = 0;
    std::size_t wholeBytes = 0;
    std::size_t tailByte = 0;
    std::size_t tailBits = 0;
    unsigned char headMask = 0;
    unsigned char tailMask = 0;
};

void setMasked(unsigned char& byte, unsigned char mask, unsigned value) {
    byte = static_cast<unsigned char>((byte & ~mask) | (value & mask));
}

/// Up to eight bytes as a number, the first one least significant.
Word loadPart(const unsigned char* bytes, std::size_t count) {
    if (count >= sizeof(Word)) {
        return loadWord(bytes);
    }
    Word word = 0;
    for (std::size_t i = 0; i < count; ++i) {
        word |= Word{bytes[i]} << (8 * i);
    }
    return word;
}

void storePart(unsigned char* bytes, std::size_t count, Word word) {
    if (count >= sizeof(Word)) {
        storeWord(bytes, word);
        return;
    }
    for (std::size_t i = 0; i < count; ++i) {
        bytes[i] = static_cast<unsigned char>(word >> (8 * i));
    }
}

unsigned lowestBit(Word word) {
    return static_cast<unsigned>(__builtin_ctzll(word));
}

// ---- Logic on whole bytes.

enum class Logic { And, Or, Xor, Complement };

/// A value of any width combined.
template <Logic logic, class Value>
TESSAL_INLINE_BODY void combineValue(Value& target, const Value& source) {
    if constexpr (logic == Logic::And) {
        target &= source;
    } else if constexpr (logic == Logic::Or) {
        target |= source;
    } else if constexpr (logic == Logic::Xor) {
        target ^= source;
    } else {
        target = ~source;
    }
}

constexpr bool readsTarget(Logic logic) {
    return logic == Logic::And || logic == Logic::Or || logic == Logic::Xor;
}

template <Logic logic, class Block>
TESSAL_INLINE_BODY void combineBody(unsigned char* target, const unsigned char* source, std::size_t count) {
    std::size_t i = 0;
    for (; i + sizeof(Block) <= count; i += sizeof(Block)) {
        Block mine{};
        Block other;
        if constexpr (readsTarget(logic)) {
            loadBlock(mine, target + i);
        }
        loadBlock(other, source + i);
        combineValue<logic>(mine, other);
        storeBlock(target + i, mine);
    }
    for (; i < count; i += sizeof(Word)) {
        const std::size_t left = count - i;
        Word mine = readsTarget(logic) ? loadPart(target + i, left) : 0;
        combineValue<logic>(mine, loadPart(source + i, left));
        storePart(target + i, left, mine);
    }
}

template <Logic logic>
TESSAL_WIDE void combineWide(unsigned char* target, const unsigned char* source, std::size_t count) {
    combineBody<logic, WideBlock>(target, source, count);
}

template <Logic logic>
void combine(unsigned char* target, const unsigned char* source, std::size_t count) {
    if (hasWideVectors()) {
        combineWide<logic>(target, source, count);
    } else {
        combineBody<logic, NarrowBlock>(target, source, count);
    }
}

// ---- Searching in whole bytes.

/// The number of leading bytes, in steps of eight words, that all equal the filler.
template <class Block>
TESSAL_INLINE_BODY std::size_t skipBody(const unsigned char* bytes, std::size_t count, Word filler) {
    constexpr std::size_t step = 8 * sizeof(Word);
    const Block fill = Block{} + filler;
    std::size_t i = 0;
    for (; i + step <= count; i += step) {
        Block differences{};
        for (std::size_t part = 0; part < step; part += sizeof(Block)) {
            Block block;
            loadBlock(block, bytes + i + part);
            differences |= block ^ fill;
        }
        if (anyBits(differences) != 0) {
            break;
        }
    }
    return i;
}

TESSAL_WIDE std::size_t skipWide(const unsigned char* bytes, std::size_t count, Word filler) {
    return skipBody<WideBlock>(bytes, count, filler);
}

std::size_t skip(const unsigned char* bytes, std::size_t count, Word filler) {
    return hasWideVectors() ? skipWide(bytes, count, filler) : skipBody<NarrowBlock>(bytes, count, filler);
}

/// Whether a copy from the low end would overwrite what it has yet to read: the target begins inside the source run.
bool beginsInside(const unsigned char* target, std::size_t targetFirst, const unsigned char* source,
                  std::size_t sourceFirst, std::size_t count) {
    target += targetFirst >> 3;
    source += sourceFirst >> 3;
    if (target == source) {
        return (targetFirst & 7) > (sourceFirst & 7);
    }
    const std::size_t sourceBytes = ((sourceFirst & 7) + count + 7) >> 3;
    return std::less<>()(source, target) && std::less<>()(target, source + sourceBytes);
}

// ---- Counting.

TESSAL_INLINE_BODY std::size_t onesOf(Word word) {
    return static_cast<std::size_t>(__builtin_popcountll(word));
}

TESSAL_INLINE_BODY std::size_t countOnesBody(const unsigned char* bytes, std::size_t first, std::size_t count) {
    const Run run(first, count);
    std::size_t ones = run.headBits != 0 ? onesOf(bytes[run.headByte] & run.headMask) : 0;
    std::size_t i = run.firstWhole;
    for (; i + sizeof(Word) <= run.tailByte; i += sizeof(Word)) {
        ones += onesOf(loadWord(bytes + i));
    }
    ones += onesOf(loadPart(bytes + i, run.tailByte - i));
    return ones + (run.tailBits != 0 ? onesOf(bytes[run.tailByte] & run.tailMask) : 0);
}

/// A processor with wide vectors counts a word in one instruction.
TESSAL_WIDE std::size_t countOnesWide(const unsigned char* bytes, std::size_t first, std::size_t count) {
    return countOnesBody(bytes, first, count);
}

}  // namespace

Word readBits(const unsigned char* bytes, std::size_t first, std::size_t count) {
    if (count == 0) {
        return 0;
    }
    bytes += first >> 3;
    const std::size_t skipped = first & 7;
    const std::size_t held = (skipped + count + 7) >> 3;
    Word word = loadPart(bytes, held) >> skipped;
    if (held > sizeof(Word)) {
        word |= Word{bytes[sizeof(Word)]} << (wordBits - skipped);
    }
    return word & lowMask(count);
}

void writeBits(unsigned char* bytes, std::size_t first, std::size_t count, Word value) {
    if (count == 0) {
        return;
    }
    bytes += first >> 3;
    const std::size_t skipped = first & 7;
    const std::size_t held = (skipped + count + 7) >> 3;
    const Word mask = lowMask(count);
    value &= mask;
    storePart(bytes, held, (loadPart(bytes, held) & ~(mask << skipped)) | value << skipped);
    if (held > sizeof(Word)) {
        setMasked(bytes[sizeof(Word)], static_cast<unsigned char>(mask >> (wordBits - skipped)),
                  static_cast<unsigned>(value >> (wordBits - skipped)));
    }
}

void copyBits(unsigned char* target, std::size_t targetFirst, const unsigned char* source, std::size_t sourceFirst,
              std::size_t count) {
    if (count <= wordBits) {
        writeBits(target, targetFirst, count, readBits(source, sourceFirst, count));
        return;
    }
    const Run run(targetFirst, count);
    const std::size_t wholeFirst = sourceFirst + run.headBits;
    const std::size_t tailFirst = wholeFirst + 8 * run.wholeBytes;
    const auto copyHead = [&] {
        writeBits(target, targetFirst, run.headBits, readBits(source, sourceFirst, run.headBits));
    };
    const auto copyTail = [&] {
        writeBits(target, 8 * run.tailByte, run.tailBits, readBits(source, tailFirst, run.tailBits));
    };
    unsigned char* const whole = target + run.firstWhole;
    if (beginsInside(target, targetFirst, source, sourceFirst, count)) {
        copyTail();
        copyBytesFromHighEnd(whole, source, wholeFirst, run.wholeBytes);
        copyHead();
    } else {
        copyHead();
        copyBytesFromLowEnd(whole, source, wholeFirst, run.wholeBytes);
        copyTail();
    }
}

void fillBits(unsigned char* bytes, std::size_t first, std::size_t count, bool value) {
    const Run run(first, count);
    const unsigned fill = value ? 0xFF : 0x00;
    if (run.headBits != 0) {
        setMasked(bytes[run.headByte], run.headMask, fill);
    }
    if (run.wholeBytes != 0) {
        std::memset(bytes + run.firstWhole, static_cast<int>(fill), run.wholeBytes);
    }
    if (run.tailBits != 0) {
        setMasked(bytes[run.tailByte], run.tailMask, fill);
    }
}

bool equalBits(const unsigned char* a, const unsigned char* b, std::size_t first, std::size_t count) {
    const Run run(first, count);
    if (run.headBits != 0 && ((a[run.headByte] ^ b[run.headByte]) & run.headMask) != 0) {
        return false;
    }
    if (run.tailBits != 0 && ((a[run.tailByte] ^ b[run.tailByte]) & run.tailMask) != 0) {
        return false;
    }
    return run.wholeBytes == 0 || std::memcmp(a + run.firstWhole, b + run.firstWhole, run.wholeBytes) == 0;
}

std::size_t findBit(const unsigned char* bytes, std::size_t first, std::size_t count, bool value) {
    const Run run(first, count);
    const Word filler = value ? 0 : ~Word{0};
    if (run.headBits != 0) {
        const Word found = (bytes[run.headByte] ^ filler) & run.headMask;
        if (found != 0) {
            return 8 * run.headByte + lowestBit(found);
        }
    }
    std::size_t i = run.firstWhole + skip(bytes + run.firstWhole, run.wholeBytes, filler);
    for (; i < run.tailByte; i += sizeof(Word)) {
        const std::size_t left = run.tailByte - i;
        const Word found = (loadPart(bytes + i, left) ^ filler) & lowMask(8 * left);
        if (found != 0) {
            return 8 * i + lowestBit(found);
        }
    }
    if (run.tailBits != 0) {
        const Word found = (bytes[run.tailByte] ^ filler) & run.tailMask;
        if (found != 0) {
            return 8 * run.tailByte + lowestBit(found);
        }
    }
    return first + count;
}

std::size_t countOnes(const unsigned char* bytes, std::size_t first, std::size_t count) {
    return hasWideVectors() ? countOnesWide(bytes, first, count) : countOnesBody(bytes, first, count);
}

std::size_t hashBits(const unsigned char* bytes, std::size_t first, std::size_t count) {
    constexpr Word multiplier = 0x9E3779B97F4A7C15U;
    Word hash = (count + 1) * multiplier;
    for (std::size_t done = 0; done < count; done += wordBits) {
        const std::size_t part = count - done < wordBits ? count - done : wordBits;
        hash = (hash ^ readBits(bytes, first + done, part)) * multiplier;
        hash ^= hash >> 29;
    }
    return hash;
}

void andBytes(unsigned char* target, const unsigned char* source, std::size_t count) {
    combine<Logic::And>(target, source, count);
}

void orBytes(unsigned char* target, const unsigned char* source, std::size_t count) {
    combine<Logic::Or>(target, source, count);
}

void xorBytes(unsigned char* target, const unsigned char* source, std::size_t count) {
    combine<Logic::Xor>(target, source, count);
}

void complementBytes(unsigned char* target, const unsigned char* source, std::size_t count) {
    combine<Logic::Complement>(target, source, count);
}

Word reverseBits(Word value, std::size_t count) {
    if (count == 0) {
        return 0;
    }
    return __builtin_bswap64(ByteTables::mirrorEachByte(value)) >> (wordBits - count);
}

}  // namespace BitKernels
