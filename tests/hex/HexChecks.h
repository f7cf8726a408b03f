// What the conversions make of any data, compared with the model; the tests and the fuzz targets bring the data.
#pragma once

#include <memory>
#include <string>
#include <string_view>
#include <vector>

#include "Hex2Bit.h"
#include "hex/HexModel.h"

namespace HexChecks {

/// The text of a new array, which is released.
inline std::string taken(const char* text) {
    const std::unique_ptr<const char[]> owner(text);
    return text != nullptr ? text : "(null)";
}

struct Load {
    std::string_view text;
    std::size_t length;
    int places;
    Numbering numbering;
    bool fill;
    bool descending;
    bool byteSwap;
};

/// The text as hex digits, as binary digits up to its first zero character, and as plain characters.
inline bool loadAgrees(const Load& load) {
    HexModel::NumberedVec hex(load.length, load.numbering, load.fill);
    HexModel::NumberedVec binary(load.length, load.numbering, load.fill);
    Model hexModel = HexModel::modelOf(hex, load.numbering);
    Model binaryModel = hexModel;
    const std::string text(load.text);
    Hex2Bit::convertHexString2BitVec(&hex, load.text, load.places, load.descending, load.byteSwap, false);
    HexModel::loadHex(hexModel, text, load.places, load.descending, load.byteSwap);
    Hex2Bit::convertBinString2BitVec(&binary, text.c_str(), load.places, load.descending);
    HexModel::loadBinary(binaryModel, text.c_str(), load.places, load.descending);

    std::string digits;
    for (const char character : text) {
        char printed[9];
        std::snprintf(printed, sizeof printed, "%x", static_cast<unsigned>(static_cast<signed char>(character)));
        digits += printed;
    }
    Model plain = HexModel::modelOf(RLBitVec(4 * digits.size(), Hex2Bit::m_initValue));
    HexModel::loadHex(plain, digits, static_cast<int>(4 * digits.size()), load.descending, load.byteSwap);
    const auto vector = Hex2Bit::convertString2BitVec(load.text, load.descending, load.byteSwap);
    return HexModel::arrayOf(hex) == hexModel.bytes && HexModel::arrayOf(binary) == binaryModel.bytes &&
           HexModel::arrayOf(*vector) == plain.bytes;
}

/// An array as text of both kinds in both orders, and as a number.
inline bool bytesAgree(const unsigned char* bytes, int bits) {
    const Model model = HexModel::modelOf(RLBitVec(bytes, static_cast<std::size_t>(bits)));
    bool agrees = Hex2Bit::convertBin2Int(bytes, bits) == HexModel::number(model);
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
    bool agrees = Hex2Bit::convertHexString2Int(text.c_str(), count) == HexModel::number(model);
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

}  // namespace HexChecks
