// The portable inner loops between text and bytes, and the choice of the fastest form.
#include "s/TextKernels.h"

#include <cstdint>
#include <cstring>

#include "s/ByteTables.h"

namespace {

std::uint64_t load64(const void* from) {
    std::uint64_t word;
    std::memcpy(&word, from, sizeof word);
    return word;
}

void mirrorBytes(const unsigned char* from, std::size_t count, unsigned char* to) {
    std::size_t i = 0;
    for (; i + 8 <= count; i += 8) {
        const std::uint64_t word = ByteTables::mirrorEachByte(load64(from + i));
        std::memcpy(to + i, &word, sizeof word);
    }
    for (; i < count; ++i) {
        to[i] = ByteTables::mirroredByte[from[i]];
    }
}

bool decodeHex(const char* text, std::size_t count, ByteOrder order, unsigned char* to) {
    unsigned seen = 0;
    for (std::size_t i = 0; i < count; ++i) {
        const unsigned high = ByteTables::valueOf(text[2 * i]);
        const unsigned low = ByteTables::valueOf(text[2 * i + 1]);
        seen |= high | low;
        const auto byte = static_cast<unsigned char>(high << 4 | low);
        to[order.lastByteFirst ? count - 1 - i : i] = order.mirrorBits ? ByteTables::mirroredByte[byte] : byte;
    }
    return seen < 16;
}

void encodeHex(const unsigned char* from, std::size_t count, ByteOrder order, char* text) {
    for (std::size_t i = 0; i < count; ++i) {
        const unsigned char byte = from[order.lastByteFirst ? count - 1 - i : i];
        const auto& pair = ByteTables::hexPair[order.mirrorBits ? ByteTables::mirroredByte[byte] : byte];
        std::memcpy(text + 2 * i, pair.data(), pair.size());
    }
}

void packBits(const char* text, std::size_t count, BitMark mark, bool lastBitFirst, unsigned char* to) {
    constexpr std::uint64_t sevenBits = 0x7F7F7F7F7F7F7F7FU;
    const std::uint64_t same = mark == BitMark::OnlyOne ? 0x3131313131313131U : 0x3030303030303030U;
    const unsigned flip = mark == BitMark::OnlyOne ? 0xFF : 0;
    for (std::size_t i = 0; i < count; ++i) {
        // The top bit of each byte tells whether the character differs; the product gathers the eight of them.
        const std::uint64_t word = load64(text + 8 * i) ^ same;
        const std::uint64_t differs = (((word & sevenBits) + sevenBits) | word) & ~sevenBits;
        const auto byte = static_cast<unsigned char>(((differs >> 7) * 0x0102040810204080U >> 56) ^ flip);
        to[lastBitFirst ? count - 1 - i : i] = lastBitFirst ? ByteTables::mirroredByte[byte] : byte;
    }
}

void unpackBits(const unsigned char* from, std::size_t count, bool lastBitFirst, char* text) {
    for (std::size_t i = 0; i < count; ++i) {
        const unsigned char byte = lastBitFirst ? ByteTables::mirroredByte[from[count - 1 - i]] : from[i];
        std::memcpy(text + 8 * i, ByteTables::bitText[byte].data(), 8);
    }
}

}  // namespace

const TextKernels& portableTextKernels() {
    static constexpr TextKernels kernels{&mirrorBytes, &decodeHex, &encodeHex, &packBits, &unpackBits};
    return kernels;
}

const TextKernels& textKernels() {
    const TextKernels* const wide = wideTextKernels();
    return wide != nullptr ? *wide : portableTextKernels();
}
