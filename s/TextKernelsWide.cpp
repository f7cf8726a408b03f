// The inner loops between text and bytes for processors with 32-byte vectors. What is left over behind the last whole
// block is done by the portable form or, for hex text, by one more block that ends there.
#include "s/TextKernels.h"

#include "s/WideVectors.h"

#if TESSAL_HAS_WIDE

#include <immintrin.h>

#include <cstdint>
#include <cstring>

namespace {

TESSAL_WIDE inline __m256i load32(const void* from) {
    return _mm256_loadu_si256(static_cast<const __m256i*>(from));
}

TESSAL_WIDE inline __m128i load16(const void* from) {
    return _mm_loadu_si128(static_cast<const __m128i*>(from));
}

TESSAL_WIDE inline void store32(void* to, __m256i value) {
    _mm256_storeu_si256(static_cast<__m256i*>(to), value);
}

TESSAL_WIDE inline void store16(void* to, __m128i value) {
    _mm_storeu_si128(static_cast<__m128i*>(to), value);
}

/// A table of 16 bytes, once in each half.
TESSAL_WIDE inline __m256i table16(std::uint64_t low, std::uint64_t high) {
    const auto a = static_cast<long long>(low);
    const auto b = static_cast<long long>(high);
    return _mm256_set_epi64x(b, a, b, a);
}

TESSAL_WIDE inline __m256i lowNibbles(__m256i bytes) {
    return _mm256_and_si256(bytes, _mm256_set1_epi8(0x0F));
}

TESSAL_WIDE inline __m256i highNibbles(__m256i bytes) {
    return lowNibbles(_mm256_srli_epi16(bytes, 4));
}

/// Nibble n as its bits in reverse order.
TESSAL_WIDE inline __m256i mirroredNibbles() {
    return table16(0x0E060A020C040800U, 0x0F070B030D050901U);
}

/// Byte i of each half is byte 15 - i.
TESSAL_WIDE inline __m256i backward() {
    return table16(0x08090A0B0C0D0E0FU, 0x0001020304050607U);
}

TESSAL_WIDE void mirrorBytes(const unsigned char* from, std::size_t count, unsigned char* to) {
    const __m256i toLow = mirroredNibbles();
    const __m256i toHigh = _mm256_slli_epi16(toLow, 4);
    std::size_t i = 0;
    for (; i + 32 <= count; i += 32) {
        const __m256i bytes = load32(from + i);
        store32(to + i, _mm256_or_si256(_mm256_shuffle_epi8(toHigh, lowNibbles(bytes)),
                                        _mm256_shuffle_epi8(toLow, highNibbles(bytes))));
    }
    portableTextKernels().mirrorBytes(from + i, count - i, to + i);
}

/// 32 hex digits as 16 bytes, each in a 16-bit lane. A byte of @p seen becomes 0 where a character is no digit.
template <bool mirrorBits>
TESSAL_WIDE inline __m256i digitPairs(__m256i text, __m256i& seen) {
    // The high nibble of a digit is 3, that of a letter 4 or 6; the low ones are 0 to 9 and 1 to 6.
    const __m256i kindOfHigh = table16(0x0002000201000000U, 0);
    const __m256i kindsOfLow = table16(0x0103030303030301U, 0x0000000000000101U);
    const __m256i addend = table16(0x0009000900000000U, 0);
    const __m256i high = highNibbles(text);
    const __m256i low = lowNibbles(text);
    const __m256i kind = _mm256_and_si256(_mm256_shuffle_epi8(kindOfHigh, high), _mm256_shuffle_epi8(kindsOfLow, low));
    seen = _mm256_min_epu8(seen, kind);
    const __m256i values = _mm256_add_epi8(low, _mm256_shuffle_epi8(addend, high));
    if constexpr (mirrorBits) {
        return _mm256_maddubs_epi16(_mm256_shuffle_epi8(mirroredNibbles(), values), _mm256_set1_epi16(0x1001));
    } else {
        return _mm256_maddubs_epi16(values, _mm256_set1_epi16(0x0110));
    }
}

/// Where block @p i of the text goes among @p count bytes.
template <bool lastByteFirst>
unsigned char* placeOf(std::size_t i, std::size_t size, std::size_t count, unsigned char* to) {
    return lastByteFirst ? to + count - size - i : to + i;
}

/// Decodes what becomes bytes @p i to @p i + size of the text, 32 or 16 of them.
template <std::size_t size, bool lastByteFirst, bool mirrorBits>
TESSAL_WIDE inline void decodeBlock(const char* text, std::size_t i, std::size_t count, unsigned char* to,
                                    __m256i& seen) {
    unsigned char* const place = placeOf<lastByteFirst>(i, size, count, to);
    const __m256i first = digitPairs<mirrorBits>(load32(text + 2 * i), seen);
    const __m256i second = size == 32 ? digitPairs<mirrorBits>(load32(text + 2 * i + 32), seen) : first;
    const __m256i quarters = _mm256_packus_epi16(first, second);  // 0 and 2 of the text, then 1 and 3
    const __m256i bytes = lastByteFirst ? _mm256_shuffle_epi8(_mm256_permute4x64_epi64(quarters, 0x8D), backward())
                                        : _mm256_permute4x64_epi64(quarters, 0xD8);
    if constexpr (size == 32) {
        store32(place, bytes);
    } else {  // both halves are the same
        store16(place, _mm256_castsi256_si128(bytes));
    }
}

/// At least one block; the last one begins inside the one before where the count is no multiple of the size.
template <std::size_t size, bool lastByteFirst, bool mirrorBits>
TESSAL_WIDE bool decodeInBlocks(const char* text, std::size_t count, unsigned char* to) {
    __m256i seen = _mm256_set1_epi8(1);
    for (std::size_t i = 0; i + size <= count; i += size) {
        decodeBlock<size, lastByteFirst, mirrorBits>(text, i, count, to, seen);
    }
    if (count % size != 0) {
        decodeBlock<size, lastByteFirst, mirrorBits>(text, count - size, count, to, seen);
    }
    return _mm256_movemask_epi8(_mm256_cmpeq_epi8(seen, _mm256_setzero_si256())) == 0;
}

template <bool lastByteFirst, bool mirrorBits>
bool decodeHex(const char* text, std::size_t count, unsigned char* to) {
    if (count >= 32) {
        return decodeInBlocks<32, lastByteFirst, mirrorBits>(text, count, to);
    }
    if (count >= 16) {
        return decodeInBlocks<16, lastByteFirst, mirrorBits>(text, count, to);
    }
    return portableTextKernels().decodeHex(text, count, {lastByteFirst, mirrorBits}, to);
}

bool decodeHexInOrder(const char* text, std::size_t count, ByteOrder order, unsigned char* to) {
    if (order.lastByteFirst) {
        return order.mirrorBits ? decodeHex<true, true>(text, count, to) : decodeHex<true, false>(text, count, to);
    }
    return order.mirrorBits ? decodeHex<false, true>(text, count, to) : decodeHex<false, false>(text, count, to);
}

/// 16 bytes as 32 hex digits.
template <bool mirrorBits>
TESSAL_WIDE inline __m256i digitsOf(__m128i bytes) {
    const __m256i lanes = _mm256_cvtepu8_epi16(bytes);
    if constexpr (mirrorBits) {  // the digits 084c 2a6e 195d 3b7f
        const __m256i digits = table16(0x6536613263343830U, 0x6637623364353931U);
        return _mm256_shuffle_epi8(digits, lowNibbles(_mm256_or_si256(lanes, _mm256_slli_epi16(lanes, 4))));
    } else {
        const __m256i digits = table16(0x3736353433323130U, 0x6665646362613938U);
        const __m256i nibbles = _mm256_or_si256(_mm256_srli_epi16(lanes, 4), _mm256_slli_epi16(lanes, 8));
        return _mm256_shuffle_epi8(digits, lowNibbles(nibbles));
    }
}

template <bool lastByteFirst, bool mirrorBits>
TESSAL_WIDE inline void encodeBlock(const unsigned char* from, std::size_t i, std::size_t count, char* text) {
    __m128i bytes = load16(from + (lastByteFirst ? count - 16 - i : i));
    if constexpr (lastByteFirst) {
        bytes = _mm_shuffle_epi8(bytes, _mm256_castsi256_si128(backward()));
    }
    store32(text + 2 * i, digitsOf<mirrorBits>(bytes));
}

template <bool lastByteFirst, bool mirrorBits>
TESSAL_WIDE void encodeHex(const unsigned char* from, std::size_t count, char* text) {
    if (count < 16) {
        portableTextKernels().encodeHex(from, count, {lastByteFirst, mirrorBits}, text);
        return;
    }
    for (std::size_t i = 0; i + 16 <= count; i += 16) {
        encodeBlock<lastByteFirst, mirrorBits>(from, i, count, text);
    }
    if (count % 16 != 0) {
        encodeBlock<lastByteFirst, mirrorBits>(from, count - 16, count, text);
    }
}

void encodeHexInOrder(const unsigned char* from, std::size_t count, ByteOrder order, char* text) {
    if (order.lastByteFirst) {
        order.mirrorBits ? encodeHex<true, true>(from, count, text) : encodeHex<true, false>(from, count, text);
    } else {
        order.mirrorBits ? encodeHex<false, true>(from, count, text) : encodeHex<false, false>(from, count, text);
    }
}

template <bool lastBitFirst>
TESSAL_WIDE void packBits(const char* text, std::size_t count, BitMark mark, unsigned char* to) {
    const __m256i same = _mm256_set1_epi8(mark == BitMark::OnlyOne ? '1' : '0');
    const std::uint32_t flip = mark == BitMark::OnlyOne ? 0 : 0xFFFFFFFFU;
    std::size_t i = 0;
    for (; i + 4 <= count; i += 4) {
        __m256i characters = load32(text + 8 * i);
        if constexpr (lastBitFirst) {
            characters = _mm256_permute4x64_epi64(_mm256_shuffle_epi8(characters, backward()), 0x4E);
        }
        const int equal = _mm256_movemask_epi8(_mm256_cmpeq_epi8(characters, same));
        const std::uint32_t bits = static_cast<std::uint32_t>(equal) ^ flip;
        std::memcpy(to + (lastBitFirst ? count - 4 - i : i), &bits, sizeof bits);
    }
    portableTextKernels().packBits(text + 8 * i, count - i, mark, lastBitFirst, lastBitFirst ? to : to + i);
}

void packBitsInOrder(const char* text, std::size_t count, BitMark mark, bool lastBitFirst, unsigned char* to) {
    lastBitFirst ? packBits<true>(text, count, mark, to) : packBits<false>(text, count, mark, to);
}

template <bool lastBitFirst>
TESSAL_WIDE void unpackBits(const unsigned char* from, std::size_t count, char* text) {
    // Each byte eight times, one bit of it kept in each.
    const __m256i spread = lastBitFirst
                               ? _mm256_setr_epi64x(0x0303030303030303, 0x0202020202020202, 0x0101010101010101, 0)
                               : _mm256_setr_epi64x(0, 0x0101010101010101, 0x0202020202020202, 0x0303030303030303);
    const __m256i bit =
        _mm256_set1_epi64x(static_cast<long long>(lastBitFirst ? 0x0102040810204080U : 0x8040201008040201U));
    std::size_t i = 0;
    for (; i + 4 <= count; i += 4) {
        std::int32_t bytes;
        std::memcpy(&bytes, from + (lastBitFirst ? count - 4 - i : i), sizeof bytes);
        const __m256i spreadOut = _mm256_shuffle_epi8(_mm256_set1_epi32(bytes), spread);
        const __m256i ones = _mm256_cmpeq_epi8(_mm256_and_si256(spreadOut, bit), bit);
        store32(text + 8 * i, _mm256_sub_epi8(_mm256_set1_epi8('0'), ones));
    }
    portableTextKernels().unpackBits(lastBitFirst ? from : from + i, count - i, lastBitFirst, text + 8 * i);
}

void unpackBitsInOrder(const unsigned char* from, std::size_t count, bool lastBitFirst, char* text) {
    lastBitFirst ? unpackBits<true>(from, count, text) : unpackBits<false>(from, count, text);
}

}  // namespace

const TextKernels* wideTextKernels() {
    static constexpr TextKernels kernels{&mirrorBytes, &decodeHexInOrder, &encodeHexInOrder, &packBitsInOrder,
                                         &unpackBitsInOrder};
    return hasWideVectors() ? &kernels : nullptr;
}

#else

const TextKernels* wideTextKernels() {
    return nullptr;
}

#endif
