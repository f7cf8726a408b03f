#include "s/HexDigits.h"

#include <cstring>

#include "s/WideVectors.h"

namespace HexDigits {

namespace {

constexpr std::array<unsigned char, 256> makeValues() {
    std::array<unsigned char, 256> table{};
    for (std::size_t character = 0; character < table.size(); ++character) {
        table[character] = noDigit;
    }
    for (unsigned char value = 0; value < 16; ++value) {
        table[static_cast<unsigned char>("0123456789abcdef"[value])] = value;
        table[static_cast<unsigned char>("0123456789ABCDEF"[value])] = value;
    }
    return table;
}

}  // namespace

const std::array<unsigned char, 256> values = makeValues();

namespace {

/// A block of characters, taken two by two as numbers of 16 bits, and the bytes that they make.
using Characters = unsigned char __attribute__((vector_size(16)));
using Pairs = std::uint16_t __attribute__((vector_size(16)));
using Decoded = unsigned char __attribute__((vector_size(8)));

constexpr std::size_t step = 64;

/// Decodes one block of characters and adds to @p foreign some bit for a character that is no digit.
TESSAL_INLINE_BODY void decodeBlock(unsigned char* bytes, const char* text, NarrowBlock& foreign) {
    Characters characters;
    loadBlock(characters, text);
    const Characters number = characters - '0';
    const Characters letter = (characters | 0x20) - 'a';
    const auto isNumber = reinterpret_cast<Characters>(number <= 9);
    const auto isLetter = reinterpret_cast<Characters>(letter <= 5);
    foreign |= reinterpret_cast<NarrowBlock>(~(isNumber | isLetter));
    const auto pairs = reinterpret_cast<Pairs>((number & isNumber) | ((letter + 10) & isLetter));
    const Decoded decoded = __builtin_convertvector((pairs << 4 | pairs >> 8) & 0xFF, Decoded);
    std::memcpy(bytes, &decoded, sizeof decoded);
}

/// Decodes characters, 64 at a time, until some of them are no digits.
std::size_t decodeBlocks(unsigned char* bytes, const char* text, std::size_t count) {
    std::size_t done = 0;
    for (; done + step <= count; done += step) {
        NarrowBlock foreign{};
        for (std::size_t part = done; part < done + step; part += sizeof(Characters)) {
            decodeBlock(bytes + part / 2, text + part, foreign);
        }
        if (anyBits(foreign) != 0) {
            break;
        }
    }
    return done;
}

#if TESSAL_HAS_WIDE
/// The values of 32 characters; above 15 for one that is no digit.
TESSAL_WIDE inline __m256i wideValues(const char* text) {
    const __m256i characters = _mm256_loadu_si256(reinterpret_cast<const __m256i*>(text));
    // The saturating steps take `0` to `9` to 0 to 9, letters to 10 to 15, and leave all others above in both ways.
    const __m256i raised = _mm256_add_epi8(characters, _mm256_set1_epi8(static_cast<char>(0xFF - '9')));
    const __m256i number = _mm256_sub_epi8(_mm256_subs_epu8(raised, _mm256_set1_epi8(6)), _mm256_set1_epi8(-16));
    const __m256i capital = _mm256_and_si256(characters, _mm256_set1_epi8(static_cast<char>(0xDF)));
    const __m256i letter = _mm256_adds_epu8(_mm256_sub_epi8(capital, _mm256_set1_epi8('A')), _mm256_set1_epi8(10));
    return _mm256_min_epu8(number, letter);
}

/// The same in the processor's own terms, which have the saturating steps and the sum of pairs.
TESSAL_WIDE std::size_t decodeBlocksWide(unsigned char* bytes, const char* text, std::size_t count) {
    const __m256i weights = _mm256_set1_epi16(0x0110);
    const __m256i aboveDigits = _mm256_set1_epi8(static_cast<char>(0xF0));
    std::size_t done = 0;
    for (; done + step <= count; done += step) {
        const __m256i low = wideValues(text + done);
        const __m256i high = wideValues(text + done + 32);
        if (_mm256_testz_si256(_mm256_or_si256(low, high), aboveDigits) == 0) {
            break;
        }
        const __m256i packed =
            _mm256_packus_epi16(_mm256_maddubs_epi16(low, weights), _mm256_maddubs_epi16(high, weights));
        _mm256_storeu_si256(reinterpret_cast<__m256i*>(bytes + done / 2), _mm256_permute4x64_epi64(packed, 0xD8));
    }
    return done;
}
#else
std::size_t decodeBlocksWide(unsigned char* bytes, const char* text, std::size_t count) {
    return decodeBlocks(bytes, text, count);
}
#endif

}  // namespace

std::size_t decodePairs(unsigned char* bytes, const char* text, std::size_t count) {
    std::size_t done = hasWideVectors() ? decodeBlocksWide(bytes, text, count) : decodeBlocks(bytes, text, count);
    for (; done + 2 <= count; done += 2) {
        const unsigned high = valueOf(text[done]);
        const unsigned low = valueOf(text[done + 1]);
        if ((high | low) > 15) {
            break;
        }
        bytes[done / 2] = static_cast<unsigned char>(high << 4 | low);
    }
    return done;
}

}  // namespace HexDigits
