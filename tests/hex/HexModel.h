// The conversions as their rules read, bit by bit, for the tests and fuzz targets to compare with.
#pragma once

#include <cstdint>
#include <string>
#include <vector>

#include "RLBitVec.h"
#include "bits/Model.h"

namespace HexModel {

/// An RLBitVec whose numbering can be chosen, filled with one value.
struct NumberedVec : RLBitVec {
    NumberedVec(std::size_t length, Numbering numbering, bool fill = false) : RLBitVec(length, fill) {
        m_forwardIndex = numbering == Numbering::Forward ? 1 : 0;
        m_byteMirrorIndex = numbering == Numbering::Mirrored ? 1 : 0;
    }
};

constexpr Numbering numberings[] = {Numbering::Usual, Numbering::Forward, Numbering::Mirrored};

inline std::vector<unsigned char> arrayOf(const RLBitVec& vector) {
    return {vector.data(), vector.data() + vector.nbytes()};
}

inline Model modelOf(const RLBitVec& vector, Numbering numbering = Numbering::Usual) {
    Model model(vector.length());
    model.numbering = numbering;
    model.bytes = arrayOf(vector);
    return model;
}

inline unsigned char mirrored(unsigned char byte) {
    unsigned result = 0;
    for (int bit = 0; bit < 8; ++bit) {
        result = result << 1 | (byte >> bit & 1U);
    }
    return static_cast<unsigned char>(result);
}

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

/// The first bits of an array as binary text, from position 0 up or from the last bit down.
inline std::string binaryText(const unsigned char* data, int count, bool positionOrder) {
    std::string text;
    for (int i = 0; i < count; ++i) {
        const int p = positionOrder ? i : count - 1 - i;
        text += (data[p / 8] >> p % 8 & 1) != 0 ? '1' : '0';
    }
    return text;
}

inline std::string hexText(std::string binary, bool byteMode) {
    const std::size_t group = byteMode ? 8 : 4;
    binary.resize((binary.size() + group - 1) / group * group, '0');
    std::string hex;
    for (std::size_t first = 0; first < binary.size(); first += group) {
        for (std::size_t digit = group; digit > 0; digit -= 4) {
            std::size_t value = 0;
            for (std::size_t bit = 0; bit < 4; ++bit) {
                value = 2 * value + (binary[first + (byteMode ? digit - 1 - bit : bit)] == '1' ? 1 : 0);
            }
            hex += "0123456789abcdef"[value];
        }
    }
    return hex;
}

/// The vector as a number from index 0 on, by the accumulator that keeps 31 bits.
inline int number(const Model& model) {
    std::uint32_t accumulator = 0;
    for (std::size_t index = 0; index < model.length; ++index) {
        accumulator = (accumulator + (model.read(index) ? 1U : 0U)) * 2;
    }
    return static_cast<int>(accumulator >> 1);
}

inline void writeNumber(Model& model, std::uint32_t value, bool fromIndexZero) {
    for (std::size_t k = 0; k < model.length && value != 0; ++k, value >>= 1) {
        model.write(fromIndexZero ? k : model.length - 1 - k, (value & 1U) != 0);
    }
}

/// The vector's characters from index 0 on; false when one above 127 ended it.
inline bool characters(const Model& model, bool stopAtNonAscii, std::string& text) {
    text.clear();
    for (std::size_t first = 0; first + 8 <= model.length; first += 8) {
        unsigned value = 0;
        for (std::size_t bit = 0; bit < 8; ++bit) {
            value = 2 * value + (model.read(first + bit) ? 1U : 0U);
        }
        if (value > 127 && stopAtNonAscii) {
            return false;
        }
        if (value > 0 && value < 128) {
            text += static_cast<char>(value);
        }
    }
    return true;
}

/// Hex digits of the vector from the address up, in byte mode.
inline std::string hexAt(const Model& model, std::size_t first, int digits) {
    std::string binary;
    for (std::size_t i = 0; i < 4 * static_cast<std::size_t>(digits); ++i) {
        binary += model.read(model.length - 1 - first - i) ? '1' : '0';
    }
    return hexText(binary, true);
}

}  // namespace HexModel
