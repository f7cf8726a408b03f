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
struct NarrowDigits {
    using Block = NarrowBlock;
    using Characters = unsigned char __attribute__((vector_size(16)));
    using Pairs = std::uint16_t __attribute__((vector_size(16)));
    using Decoded = unsigned char __attribute__((vector_size(8)));
};

#if TESSAL_HAS_WIDE
struct WideDigits {
    using Block = WideBlock;
    using Characters = unsigned char __attribute__((vector_size(32)));
    using Pairs = std::uint16_t __attribute__((vector_size(32)));
    using Decoded = unsigned char __attribute__((vector_size(16)));
};
#else
using WideDigits = NarrowDigits;
#endif

/// Decodes one block of characters and adds to @p foreign some bit for a character that is no digit.
template <class Digits>
TESSAL_INLINE_BODY void decodeBlock(unsigned char* bytes, const char* text, typename Digits::Block& foreign) {
    using Characters = typename Digits::Characters;
    Characters characters;
    loadBlock(characters, text);
    const Characters number = characters - '0';
    const Characters letter = (characters | 0x20) - 'a';
    const auto isNumber = reinterpret_cast<Characters>(number <= 9);
    const auto isLetter = reinterpret_cast<Characters>(letter <= 5);
    foreign |= reinterpret_cast<typename Digits::Block>(~(isNumber | isLetter));
    const auto pairs = reinterpret_cast<typename Digits::Pairs>((number & isNumber) | ((letter + 10) & isLetter));
    const auto decoded = __builtin_convertvector((pairs << 4 | pairs >> 8) & 0xFF, typename Digits::Decoded);
    std::memcpy(bytes, &decoded, sizeof decoded);
}

/// Decodes characters, 64 at a time, until some of them are no digits.
template <class Digits>
TESSAL_INLINE_BODY std::size_t decodeBlocks(unsigned char* bytes, const char* text, std::size_t count) {
    using Block = typename Digits::Block;
    constexpr std::size_t step = 64;
    std::size_t done = 0;
    for (; done + step <= count; done += step) {
        Block foreign{};
        for (std::size_t part = done; part < done + step; part += sizeof(Block)) {
            decodeBlock<Digits>(bytes + part / 2, text + part, foreign);
        }
        if (anyBits(foreign) != 0) {
            break;
        }
    }
    return done;
}

TESSAL_WIDE std::size_t decodeBlocksWide(unsigned char* bytes, const char* text, std::size_t count) {
    return decodeBlocks<WideDigits>(bytes, text, count);
}

}  // namespace

std::size_t decodePairs(unsigned char* bytes, const char* text, std::size_t count) {
    std::size_t done =
        hasWideVectors() ? decodeBlocksWide(bytes, text, count) : decodeBlocks<NarrowDigits>(bytes, text, count);
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
