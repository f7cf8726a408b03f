// The conversions as their rules read, bit by bit, for the tests and fuzz targets to compare with.
#pragma once

#include <cctype>
#include <cstdint>
#include <string>
#include <vector>

#include "RLBitVec.h"

namespace HexModel {

enum class Numbering { Usual, Forward, ByteMirror };

/// An RLBitVec whose numbering can be chosen.
struct NumberedVec : RLBitVec {
    NumberedVec(std::size_t length, Numbering numbering) : RLBitVec(length) {
        m_forwardIndex = numbering == Numbering::Forward ? 1 : 0;
        m_byteMirrorIndex = numbering == Numbering::ByteMirror ? 1 : 0;
    }
};

/// The bits of a vector's whole array, slack included, by storage position.
struct Vector {
    Vector(const RLBitVec& vector, Numbering order) : length(vector.length()), numbering(order) {
        for (std::size_t p = 0; p < 8 * vector.nbytes(); ++p) {
            storage.push_back((vector.data()[p / 8] >> p % 8 & 1) != 0);
        }
    }

    std::size_t position(std::size_t index) const {
        switch (numbering) {
            case Numbering::ByteMirror:
                return index / 8 * 8 + 7 - index % 8;
            case Numbering::Forward:
                return index;
            default:
                return length - 1 - index;
        }
    }
    void write(std::size_t index, bool value) {
        if (index < length) {
            storage.at(position(index)) = value;
        }
    }
    bool read(std::size_t index) const { return index < length && storage.at(position(index)); }
    /// The array is the same, slack included.
    bool matches(const RLBitVec& vector) const { return Vector(vector, numbering).storage == storage; }

    std::vector<bool> storage;
    std::size_t length;
    Numbering numbering;
};

inline int digitValue(char character) {
    const auto byte = static_cast<unsigned char>(character);
    if (byte >= 128 || std::isxdigit(byte) == 0) {
        return -1;
    }
    return std::isdigit(byte) != 0 ? byte - '0' : std::tolower(byte) - 'a' + 10;
}

inline unsigned char mirrored(unsigned char byte) {
    unsigned result = 0;
    for (int bit = 0; bit < 8; ++bit) {
        result = result << 1 | (byte >> bit & 1U);
    }
    return static_cast<unsigned char>(result);
}

inline void loadHex(Vector& vector, const std::string& text, int size, bool descending, bool byteSwap) {
    std::string ordered = text;
    for (std::size_t i = 1; byteSwap && i < text.size(); i += 2) {
        std::swap(ordered[i - 1], ordered[i]);
    }
    std::vector<bool> stream;
    for (const char character : ordered) {
        for (int bit = 0; bit < 4 && digitValue(character) >= 0; ++bit) {
            stream.push_back((digitValue(character) >> (byteSwap ? bit : 3 - bit) & 1) != 0);
        }
    }
    const auto places = static_cast<std::size_t>(size > 0 ? size : 0);
    const std::size_t dropped = 4 * text.size() > places ? 4 * text.size() - places : 0;
    for (std::size_t k = dropped; k < stream.size(); ++k) {
        vector.write(descending ? places - 1 - (k - dropped) : k - dropped, stream[k]);
    }
}

inline void loadBinary(Vector& vector, const std::string& text, int size, bool descending) {
    for (int k = 0; k < size && k < static_cast<int>(text.size()); ++k) {
        if (text[static_cast<std::size_t>(k)] != '0') {
            vector.write(static_cast<std::size_t>(descending ? size - 1 - k : k), true);
        }
    }
}

/// The bits of an array as binary text, from position 0 up or from the last bit down.
inline std::string binaryText(const unsigned char* data, int count, bool positionOrder) {
    std::string text;
    for (int i = 0; i < count; ++i) {
        const int p = positionOrder ? i : count - 1 - i;
        text.push_back((data[p / 8] >> p % 8 & 1) != 0 ? '1' : '0');
    }
    return text;
}

inline std::string hexText(std::string binary, bool byteMode) {
    const std::size_t group = byteMode ? 8 : 4;
    binary.resize((binary.size() + group - 1) / group * group, '0');
    std::string hex;
    for (std::size_t first = 0; first < binary.size(); first += group) {
        for (std::size_t digit = group; digit > 0; digit -= 4) {
            int value = 0;
            for (std::size_t bit = 0; bit < 4; ++bit) {
                const bool one = binary[first + (byteMode ? digit - 1 - bit : bit)] == '1';
                value = 2 * value + (one ? 1 : 0);
            }
            hex.push_back("0123456789abcdef"[value]);
        }
    }
    return hex;
}

/// The vector as a number from index 0 on, by the accumulator that keeps 31 bits.
inline int number(const Vector& vector) {
    std::uint32_t accumulator = 0;
    for (std::size_t index = 0; index < vector.length; ++index) {
        accumulator = (accumulator + (vector.read(index) ? 1U : 0U)) * 2;
    }
    return static_cast<int>(accumulator >> 1);
}

inline void writeNumber(Vector& vector, std::uint32_t value, bool fromIndexZero) {
    for (std::size_t k = 0; k < vector.length && value != 0; ++k, value >>= 1) {
        vector.write(fromIndexZero ? k : vector.length - 1 - k, (value & 1U) != 0);
    }
}

/// The vector's characters from index 0 on; false when one above 127 ended it.
inline bool characters(const Vector& vector, bool stopAtNonAscii, std::string& text) {
    text.clear();
    for (std::size_t first = 0; first + 8 <= vector.length; first += 8) {
        unsigned value = 0;
        for (std::size_t bit = 0; bit < 8; ++bit) {
            value = 2 * value + (vector.read(first + bit) ? 1U : 0U);
        }
        if (value > 127 && stopAtNonAscii) {
            return false;
        }
        if (value > 0 && value < 128) {
            text.push_back(static_cast<char>(value));
        }
    }
    return true;
}

/// Hex digits of the vector from the address up, in byte mode.
inline std::string hexAt(const Vector& vector, std::size_t first, int digits) {
    std::string binary;
    for (int i = 0; i < 4 * digits; ++i) {
        binary.push_back(vector.read(vector.length - 1 - first - static_cast<std::size_t>(i)) ? '1' : '0');
    }
    return hexText(binary, true);
}

}  // namespace HexModel
