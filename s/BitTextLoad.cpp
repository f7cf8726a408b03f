// Text to bits.
#include <algorithm>
#include <array>
#include <cstring>

#include "s/BitKernels.h"
#include "s/BitText.h"
#include "s/ByteTables.h"

namespace BitText {

namespace {

/// Characters that are worked on at a time; even, so that pairs stay together.
constexpr std::size_t blockCharacters = 2048;

/// Takes the stream of bits in blocks and lays each where it belongs.
class StreamWriter {
public:
    /// @param toDrop the number of bits at the front of the stream that have no place
    StreamWriter(unsigned char* bytes, std::size_t length, Placement placement, std::size_t toDrop)
        : m_bytes(bytes), m_descending(placement.descending), m_toDrop(toDrop) {
        const std::size_t size = std::min(placement.size, length);
        m_next = m_descending ? length - size : length;
        m_room = m_descending ? size : length;
        if (m_descending) {
            m_toDrop += placement.size - size;
        }
    }

    /// The next bits of the stream, in the order of positions: rising when descending, otherwise falling.
    void take(const unsigned char* block, std::size_t bits) {
        const std::size_t dropped = std::min(m_toDrop, bits);
        const std::size_t count = std::min(bits - dropped, m_room);
        m_toDrop -= dropped;
        m_room -= count;
        if (m_descending) {
            BitKernels::copyBits(m_bytes, m_next, block, dropped, count);
            m_next += count;
        } else {
            m_next -= count;
            BitKernels::copyBits(m_bytes, m_next, block, bits - dropped - count, count);
        }
    }

private:
    unsigned char* m_bytes;
    bool m_descending;
    std::size_t m_toDrop;
    std::size_t m_next = 0;  ///< the position at which the next bits begin, or behind which they end
    std::size_t m_room = 0;
};

/// The digits of the text in the order of a text without other characters, which gives the same stream.
std::size_t digitsOnly(std::string_view text, bool byteSwap, char* digits) {
    std::size_t count = 0;
    for (std::size_t i = 0; i < text.size(); ++i) {
        const std::size_t partner = i ^ 1U;
        const char character = text[byteSwap && partner < text.size() ? partner : i];
        digits[count] = character;
        count += isHexDigit(character) ? 1 : 0;
    }
    if (byteSwap) {
        for (std::size_t i = 1; i < count; i += 2) {
            std::swap(digits[i - 1], digits[i]);
        }
    }
    return count;
}

/// Hands the bits of digits to the writer. False, with nothing done, when a character is no digit.
bool takeDigits(StreamWriter& writer, std::string_view digits, bool descending, bool byteSwap) {
    const ByteOrder order{!descending, descending != byteSwap};
    const std::size_t pairs = digits.size() / 2;
    unsigned char block[blockCharacters / 2];
    if (!textKernels().decodeHex(digits.data(), pairs, order, block)) {
        return false;
    }
    unsigned char last = 0;
    if (digits.size() % 2 != 0) {
        last = ByteTables::valueOf(digits.back());
        if (last == ByteTables::notADigit) {
            return false;
        }
        last = order.mirrorBits ? static_cast<unsigned char>(ByteTables::mirroredByte[last] >> 4) : last;
    }
    writer.take(block, 8 * pairs);
    writer.take(&last, 4 * (digits.size() % 2));
    return true;
}

}  // namespace

bool isHexDigit(char character) {
    return ByteTables::valueOf(character) != ByteTables::notADigit;
}

void packHexRepeating(unsigned char* bytes, std::string_view text, char& last) {
    constexpr ByteOrder asAppended{false, true};
    const std::size_t pairs = text.size() / 2;
    std::array<char, longestAppended> repeated;
    if (!textKernels().decodeHex(text.data(), pairs, asAppended, bytes) || !isHexDigit(text.back())) {
        for (std::size_t i = 0; i < text.size(); ++i) {
            last = isHexDigit(text[i]) ? text[i] : last;
            repeated[i] = last;
        }
        text = {repeated.data(), text.size()};
        textKernels().decodeHex(text.data(), pairs, asAppended, bytes);
    }
    last = text.back();
    if (text.size() % 2 != 0) {
        bytes[pairs] = static_cast<unsigned char>(ByteTables::mirroredByte[ByteTables::valueOf(last)] >> 4);
    }
}

void loadHex(unsigned char* bytes, std::size_t length, std::string_view text, Placement placement, bool byteSwap) {
    const std::size_t textBits = 4 * text.size();
    StreamWriter writer(bytes, length, placement, textBits - std::min(textBits, placement.size));
    for (std::size_t done = 0; done < text.size(); done += blockCharacters) {
        const std::string_view block = text.substr(done, blockCharacters);
        if (!takeDigits(writer, block, placement.descending, byteSwap)) {
            char digits[blockCharacters];
            const std::size_t count = digitsOnly(block, byteSwap, digits);
            takeDigits(writer, {digits, count}, placement.descending, byteSwap);
        }
    }
}

void loadBinary(unsigned char* bytes, std::size_t length, std::string_view text, Placement placement) {
    text = text.substr(0, placement.size);
    const std::size_t beyond = placement.size - std::min(placement.size, length);
    if (placement.descending) {
        text.remove_prefix(std::min(text.size(), beyond));
    } else {
        text = text.substr(0, length);
    }
    const Order order = placement.descending ? Order::Rising : Order::Falling;
    std::size_t next = placement.descending ? length - (placement.size - beyond) : length;
    while (!text.empty()) {
        const std::string_view part = text.substr(0, blockCharacters);
        const std::size_t count = (part.size() + 7) / 8;
        const std::size_t unused = placement.descending ? 0 : 8 * count - part.size();
        unsigned char ones[blockCharacters / 8];
        unsigned char present[blockCharacters / 8] = {};
        packText(part, BitMark::AllButZero, order, ones);
        const std::size_t first = placement.descending ? next : next - part.size();
        BitKernels::copyBits(present, unused, bytes, first, part.size());
        BitKernels::orBytes(ones, present, count);
        BitKernels::copyBits(bytes, first, ones, unused, part.size());
        next = placement.descending ? next + part.size() : first;
        text.remove_prefix(part.size());
    }
}

}  // namespace BitText
