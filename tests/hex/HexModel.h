// The conversions as their rules read, bit by bit, for the tests and fuzz targets to compare with.
#pragma once

#include <algorithm>
#include <bitset>
#include <cstdint>
#include <string>
#include <utility>
#include <vector>

#include "bits/Model.h"

namespace HexModel {

constexpr Numbering numberings[] = {Numbering::Usual, Numbering::Forward, Numbering::Mirrored};

inline void loadHex(Model& model, std::string text, int size, bool descending, bool byteSwap) {
    for (std::size_t i = 1; byteSwap && i < text.size(); i += 2) {
        std::swap(text[i - 1], text[i]);
    }
    std::vector<bool> stream;
    for (const char character : text) {
        for (int bit = 0; bit < 4 && digitValue(character) >= 0; ++bit) {
            stream.push_back((digitValue(character) >> (byteSwap ? bit : 3 - bit) & 1) != 0);
        }
    }
    const auto places = static_cast<std::size_t>(size > 0 ? size : 0);
    const std::size_t dropped = 4 * text.size() > places ? 4 * text.size() - places : 0;
    for (std::size_t k = dropped; k < stream.size(); ++k) {
        model.write(descending ? places - 1 - (k - dropped) : k - dropped, stream[k]);
    }
}

inline void loadBinary(Model& model, const std::string& text, int size, bool descending) {
    for (int k = 0; k < size && k < static_cast<int>(text.size()); ++k) {
        if (text[static_cast<std::size_t>(k)] != '0') {
            model.write(static_cast<std::size_t>(descending ? size - 1 - k : k), true);
        }
    }
}

/// The bits as binary text, from index 0 on; so it reads as a number.
inline std::string binaryText(const Model& model) {
    std::string text;
    for (std::size_t index = 0; index < model.length; ++index) {
        text += model.read(index) ? '1' : '0';
    }
    return text;
}

inline std::string turned(std::string text) {
    std::reverse(text.begin(), text.end());
    return text;
}

inline unsigned char mirrored(unsigned char byte) {
    return static_cast<unsigned char>(std::bitset<8>(turned(std::bitset<8>(byte).to_string())).to_ulong());
}

inline std::string hexText(std::string binary, bool byteMode) {
    const std::size_t group = byteMode ? 8 : 4;
    binary.resize((binary.size() + group - 1) / group * group, '0');
    std::string hex;
    for (std::size_t first = 0; first < binary.size(); first += group) {
        const std::string bits = binary.substr(first, group);
        const unsigned long value = std::stoul(byteMode ? turned(bits) : bits, nullptr, 2);
        hex += byteMode ? std::string(1, "0123456789abcdef"[value / 16]) : "";
        hex += "0123456789abcdef"[value % 16];
    }
    return hex;
}

/// The number that the last 31 digits are.
inline int number(const std::string& binary) {
    const std::size_t dropped = binary.size() - std::min<std::size_t>(binary.size(), 31);
    return static_cast<int>(std::bitset<31>(binary, dropped).to_ulong());
}

inline void writeNumber(Model& model, std::uint32_t value, bool fromIndexZero) {
    for (std::size_t k = 0; k < model.length && value != 0; ++k, value >>= 1) {
        model.write(fromIndexZero ? k : model.length - 1 - k, (value & 1U) != 0);
    }
}

/// The vector's characters from index 0 on, behind false when one above 127 ended them.
inline std::pair<bool, std::string> characters(const std::string& binary, bool stopAtNonAscii) {
    std::string text;
    for (std::size_t first = 0; first + 8 <= binary.size(); first += 8) {
        const unsigned long value = std::stoul(binary.substr(first, 8), nullptr, 2);
        if (value > 127 && stopAtNonAscii) {
            return {false, text};
        }
        if (value > 0 && value < 128) {
            text += static_cast<char>(value);
        }
    }
    return {true, text};
}

/// Hex digits of the vector from the position up, in byte mode.
inline std::string hexAt(const std::string& binary, std::size_t position, std::size_t digits) {
    std::string rising = turned(binary).substr(position);
    rising.resize(4 * digits, '0');
    return hexText(rising, true);
}

}  // namespace HexModel
