// Bits to text.
#include "s/BitText.h"

#include <algorithm>
#include <cstring>

#include "s/BitKernels.h"

namespace BitText {

namespace {

constexpr std::size_t blockBytes = 512;

/// Calls emit(bytes, count, bits) for pieces of the run in the order of the text. Only the last piece may leave bits of
/// its bytes unused: the top ones in rising order, the low ones in falling order. They are 0 there.
template <class Emit>
void forEachPiece(Run run, Order order, Emit emit) {
    const bool falling = order == Order::Falling;
    std::size_t left = run.count;
    const auto firstOfNext = [&](std::size_t bits) { return run.first + (falling ? left - bits : run.count - left); };
    if ((falling ? run.first + run.count : run.first) % 8 == 0 && left >= 8) {
        const std::size_t whole = left / 8;
        emit(run.bytes + firstOfNext(8 * whole) / 8, whole, 8 * whole);
        left %= 8;
    }
    while (left > 0) {
        unsigned char block[blockBytes];
        const std::size_t bits = std::min(left, 8 * blockBytes);
        const std::size_t count = (bits + 7) / 8;
        block[0] = 0;
        block[count - 1] = 0;
        BitKernels::copyBits(block, falling ? 8 * count - bits : 0, run.bytes, firstOfNext(bits), bits);
        emit(block, count, bits);
        left -= bits;
    }
}

/// Writes the text of a run: convert(bytes, count, text) turns whole bytes, and length(bits) tells the characters of so
/// many bits.
template <class Convert, class Length>
void makeText(Run run, Order order, char* text, Convert convert, Length length) {
    const bool falling = order == Order::Falling;
    forEachPiece(run, order, [&](const unsigned char* bytes, std::size_t count, std::size_t bits) {
        const std::size_t whole = bits / 8;
        convert(falling ? bytes + count - whole : bytes, whole, text);
        text += length(8 * whole);
        if (whole < count) {
            char last[8];
            convert(falling ? bytes : bytes + whole, 1, last);
            std::memcpy(text, last, length(bits % 8));
            text += length(bits % 8);
        }
    });
}

}  // namespace

void makeBinary(Run run, Order order, char* text) {
    const auto convert = [&](const unsigned char* bytes, std::size_t count, char* to) {
        textKernels().unpackBits(bytes, count, order == Order::Falling, to);
    };
    makeText(run, order, text, convert, [](std::size_t bits) { return bits; });
}

void makeHex(Run run, Order order, Digits digits, char* text) {
    const bool falling = order == Order::Falling;
    const auto convert = [&](const unsigned char* bytes, std::size_t count, char* to) {
        textKernels().encodeHex(bytes, count, {falling, falling == (digits == Digits::OfBytes)}, to);
    };
    makeText(run, order, text, convert, [=](std::size_t bits) { return hexLength(bits, digits); });
}

void packText(std::string_view text, BitMark mark, Order order, unsigned char* to) {
    const bool falling = order == Order::Falling;
    const std::size_t whole = text.size() / 8;
    const std::size_t rest = text.size() % 8;
    textKernels().packBits(text.data(), whole, mark, falling, falling && rest != 0 ? to + 1 : to);
    if (rest != 0) {
        char last[8] = {'0', '0', '0', '0', '0', '0', '0', '0'};
        std::memcpy(last, text.data() + 8 * whole, rest);
        textKernels().packBits(last, 1, mark, falling, falling ? to : to + whole);
    }
}

}  // namespace BitText
