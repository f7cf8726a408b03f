// Any bytes to text and numbers, and any text to numbers, against the model.

#include <cstdint>
#include <cstdlib>
#include <memory>
#include <string>
#include <vector>

#include "Hex2Bit.h"
#include "HkMessageManager.h"
#include "hex/HexModel.h"

namespace {

using HexModel::Numbering;

void require(bool holds) {
    if (!holds) {
        std::abort();
    }
}

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
    const HexModel::Vector model(vector, numbering);
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
    const RLBitVec empty(4 * static_cast<std::size_t>(count));
    HexModel::Vector model(empty, Numbering::Usual);
    HexModel::loadHex(model, text, 4 * count, false, false);
    require(Hex2Bit::convertHexString2Int(text.c_str(), count) == HexModel::number(model));
}

}  // namespace

extern "C" int LLVMFuzzerTestOneInput(const std::uint8_t* data, std::size_t size) {
    if (size < 4) {
        return 0;
    }
    // Messages of vectors that are no text are not shown.
    HkMessageManager::setHandler([](const HkMessage&, void*) {}, nullptr);
    const unsigned flags = data[0];
    const std::uint8_t* const bytes = data + 4;
    const std::size_t length = 8 * (size - 4) - (size > 4 ? flags % 8 : 0);
    const auto numbering = static_cast<Numbering>((flags >> 3) % 3);

    bytesToText(bytes, static_cast<int>(length));
    HexModel::NumberedVec vector(length, numbering);
    for (std::size_t i = 0; i < length; ++i) {
        if ((bytes[i / 8] >> i % 8 & 1) != 0) {
            vector.setBit(i);
        }
    }
    vectorToText(vector, numbering, data[1], data[2] / 2 * 2, flags >= 128);
    textToText(reinterpret_cast<const char*>(std::string(bytes, bytes + size - 4).c_str()), data[3]);
    return 0;
}
