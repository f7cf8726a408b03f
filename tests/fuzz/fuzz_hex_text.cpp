// Any bytes to text and numbers, and any text to numbers, against the model.
#include <memory>

#include "Hex2Bit.h"
#include "fuzz/Fuzz.h"
#include "hex/HexModel.h"

namespace {

std::string taken(const char* text) {
    const std::unique_ptr<const char[]> owner(text);
    return text;
}

void bytesToText(const unsigned char* bytes, int bits) {
    for (const bool positionOrder : {false, true}) {
        const std::string binary = HexModel::binaryText(bytes, bits, positionOrder);
        require(taken(Hex2Bit::convertBinData2BinString(bytes, bits, positionOrder)) == binary);
        for (const bool byteMode : {false, true}) {
            require(taken(Hex2Bit::convertBinData2HexString(bytes, bits, positionOrder, byteMode)) ==
                    HexModel::hexText(binary, byteMode));
        }
    }
}

void vectorToText(const RLBitVec& vector, Numbering numbering, std::size_t address, int digits, bool stop) {
    const Model model = HexModel::modelOf(vector, numbering);
    std::string expected;
    std::vector<char> out(vector.length() / 8 + 1);
    const bool result = HexModel::characters(model, stop, expected);
    require(Hex2Bit::convertBitVec2String(&vector, out.data(), stop) == result && out.data() == expected);
    const char* const hex = Hex2Bit::getHexStringByHexAddress(&vector, static_cast<int>(address), digits, 1);
    require((hex == nullptr) == (address >= vector.length()));
    require(hex == nullptr || taken(hex) == HexModel::hexAt(model, address, digits));
}

void textToText(const std::string& text, int count) {
    std::string cut = text.substr(0, static_cast<std::size_t>(count));
    cut.resize(static_cast<std::size_t>(count), '0');
    for (const bool byteMode : {false, true}) {
        require(taken(Hex2Bit::convertBinString2HexString(text.c_str(), count, byteMode)) ==
                HexModel::hexText(cut, byteMode));
    }
    Model model = HexModel::modelOf(RLBitVec(4 * static_cast<std::size_t>(count)));
    HexModel::loadHex(model, text, 4 * count, false, false);
    require(Hex2Bit::convertHexString2Int(text.c_str(), count) == HexModel::number(model));
}

}  // namespace

void fuzz(Input input) {
    const unsigned flags = input.byte();
    const unsigned address = input.byte();
    const auto digits = static_cast<int>(input.byte() / 2 * 2);
    const auto count = static_cast<int>(input.byte());
    const auto* const bytes = reinterpret_cast<const unsigned char*>(input.bytes().data());
    const std::size_t length = 8 * input.bytes().size() - (input.isEmpty() ? 0 : flags % 8);
    const Numbering numbering = HexModel::numberings[(flags >> 3) % 3];

    bytesToText(bytes, static_cast<int>(length));
    HexModel::NumberedVec vector(length, numbering);
    for (std::size_t i = 0; i < length; ++i) {
        if ((bytes[i / 8] >> i % 8 & 1) != 0) {
            vector.setBit(i);
        }
    }
    vectorToText(vector, numbering, address, digits, flags >= 128);
    textToText(input.text(), count);
}
