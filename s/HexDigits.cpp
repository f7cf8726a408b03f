#include "s/HexDigits.h"

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

std::size_t decodePairs(unsigned char* bytes, const char* text, std::size_t count) {
    std::size_t done = 0;
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
