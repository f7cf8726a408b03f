// What the conversions make of any data, compared with the model; the tests and the fuzz targets bring the input.
#pragma once

#include <memory>
#include <string>
#include <string_view>
#include <vector>

#include "Hex2Bit.h"
#include "fuzz/Fuzz.h"
#include "hex/HexModel.h"

namespace HexChecks {

/// The text of a new array, which is released.
inline std::string taken(const char* text) {
    const std::unique_ptr<const char[]> owner(text);
    return text != nullptr ? text : "(null)";
}

/// The text as hex digits, as binary digits up to its first zero character, and as plain characters. The input's first
/// bytes tell how and where to, the others are the text.
inline bool loadAgrees(Input input) {
    const unsigned flags = input.byte();
    const bool descending = (flags & 1U) != 0;
    const bool byteSwap = (flags & 2U) != 0;
    const bool fill = (flags & 4U) != 0;
    const Numbering numbering = HexModel::numberings[(flags >> 3) % 3];
    Hex2Bit::setInitValue((flags & 0x20U) != 0);
    const unsigned lowPlaces = input.byte();
    const auto places = static_cast<int>(lowPlaces | (input.byte() & 0x7FU) << 8);
    const std::size_t length = static_cast<std::size_t>(places) + input.byte() % 70;
    HexModel::NumberedVec hex(length, numbering, fill);
    HexModel::NumberedVec binary(length, numbering, fill);
    Model hexModel = HexModel::modelOf(hex, numbering);
    Model binaryModel = hexModel;
    const std::string text(input.bytes());
    Hex2Bit::convertHexString2BitVec(&hex, input.bytes(), places, descending, byteSwap, false);
    HexModel::loadHex(hexModel, text, places, descending, byteSwap);
    Hex2Bit::convertBinString2BitVec(&binary, text.c_str(), places, descending);
    HexModel::loadBinary(binaryModel, text.c_str(), places, descending);

    std::string digits;
    for (const char character : text) {
        char printed[9];
        std::snprintf(printed, sizeof printed, "%x", static_cast<unsigned>(static_cast<signed char>(character)));
        digits += printed;
    }
    Model plain = HexModel::modelOf(RLBitVec(4 * digits.size(), Hex2Bit::m_initValue));
    HexModel::loadHex(plain, digits, static_cast<int>(4 * digits.size()), descending, byteSwap);
    const auto vector = Hex2Bit::convertString2BitVec(input.bytes(), descending, byteSwap);
    return HexModel::arrayOf(hex) == hexModel.bytes && HexModel::arrayOf(binary) == binaryModel.bytes &&
           HexModel::arrayOf(*vector) == plain.bytes;
}

/// An array as text of both kinds in both orders, and as a number.
inline bool bytesAgree(const unsigned char* bytes, int bits) {
    const Model model = HexModel::modelOf(RLBitVec(bytes, static_cast<std::size_t>(bits)));
    bool agrees = Hex2Bit::convertBin2Int(bytes, bits) == HexModel::number(model) &&
                  Hex2Bit::convertBin2Long(bytes, bits) == HexModel::number(model);
    for (const bool positionOrder : {false, true}) {
        const std::string binary = HexModel::binaryText(bytes, bits, positionOrder);
        agrees = agrees && taken(Hex2Bit::convertBinData2BinString(bytes, bits, positionOrder)) == binary;
        for (const bool byteMode : {false, true}) {
            agrees = agrees && taken(Hex2Bit::convertBinData2HexString(bytes, bits, positionOrder, byteMode)) ==
                                   HexModel::hexText(binary, byteMode);
        }
    }
    return agrees;
}

/// The first characters as binary text, and as hex digits of a number, with the fill value that is set.
inline bool textAgrees(const std::string& text, int count) {
    const auto characters = static_cast<std::size_t>(count);
    std::string cut = text.substr(0, characters);
    cut.resize(characters, '0');
    Model model = HexModel::modelOf(RLBitVec(4 * characters, Hex2Bit::m_initValue));
    HexModel::loadHex(model, text, 4 * count, false, false);
    bool agrees = Hex2Bit::convertHexString2Int(text.c_str(), count) == HexModel::number(model) &&
                  Hex2Bit::convertHexString2Long(text.c_str(), count) == HexModel::number(model);
    for (const bool byteMode : {false, true}) {
        agrees = agrees && taken(Hex2Bit::convertBinString2HexString(text.c_str(), count, byteMode)) ==
                               HexModel::hexText(cut, byteMode);
    }
    return agrees;
}

/// A vector as characters, and as hex digits from an address on.
inline bool vectorAgrees(const RLBitVec& vector, Numbering numbering, std::size_t address, int digits, bool stop) {
    const Model model = HexModel::modelOf(vector, numbering);
    std::string expected;
    std::vector<char> out(vector.length() / 8 + 1);
    const bool result = HexModel::characters(model, stop, expected);
    const bool agrees = Hex2Bit::convertBitVec2String(&vector, out.data(), stop) == result && out.data() == expected;
    return agrees && taken(Hex2Bit::getHexStringByHexAddress(&vector, static_cast<int>(address), digits, 1)) ==
                         (address < vector.length() ? HexModel::hexAt(model, address, digits) : "(null)");
}

/// A number into the vector, taken without a sign and with one, counted from either end.
inline bool numberAgrees(RLBitVec& vector, Numbering numbering, std::uint32_t value) {
    const HexModel::NumberedVec filled(vector.length(), numbering, Hex2Bit::m_initValue);
    bool agrees = true;
    for (const bool fromIndexZero : {false, true}) {
        for (const bool isSigned : {false, true}) {
            const auto number = static_cast<int>(value);
            isSigned ? Hex2Bit::convertInt2BitVec(number, 9, &vector, fromIndexZero)
                     : Hex2Bit::convertInt2BitVec(value, 9, &vector, fromIndexZero);
            Model model = HexModel::modelOf(filled, numbering);
            HexModel::writeNumber(model, isSigned && number < 0 ? 0 : value, fromIndexZero);
            agrees = agrees && HexModel::arrayOf(vector) == model.bytes;
        }
    }
    return agrees;
}

/// All of these on the input's bytes behind the first ones, which tell how.
inline bool readingAgrees(Input input) {
    const unsigned flags = input.byte();
    const unsigned address = input.byte();
    const unsigned digits = input.byte() / 2 * 2;
    const unsigned count = input.byte();
    const auto* const bytes = reinterpret_cast<const unsigned char*>(input.bytes().data());
    const std::size_t length = 8 * input.bytes().size() - (input.isEmpty() ? 0 : flags % 8);
    const Numbering numbering = HexModel::numberings[(flags >> 3) % 3];
    Hex2Bit::setInitValue((flags & 0x20U) != 0);
    HexModel::NumberedVec vector(length, numbering);
    for (std::size_t i = 0; i < length; ++i) {
        if ((bytes[i / 8] >> i % 8 & 1) != 0) {
            vector.setBit(i);
        }
    }
    const std::uint32_t value = (address << 24 | digits << 16 | count << 8 | flags) >> count % 32;
    return bytesAgree(bytes, static_cast<int>(length)) && textAgrees(input.text(), static_cast<int>(count)) &&
           vectorAgrees(vector, numbering, address, static_cast<int>(digits), flags >= 128) &&
           numberAgrees(vector, numbering, value);
}

}  // namespace HexChecks
