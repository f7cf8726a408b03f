// What the conversions make of any data, compared with the model; the tests and the fuzz target bring the input.
#pragma once

#include <memory>
#include <string>
#include <string_view>
#include <vector>

#include "Hex2Bit.h"
#include "fuzz/Fuzz.h"
#include "hex/HexModel.h"

namespace HexChecks {

// Bits whose index lies beyond the vector are passed over, where that is no failed assertion.
#ifdef NDEBUG
constexpr bool passesOver = true;
#else
constexpr bool passesOver = false;
#endif

/// The text of a new array, which is released.
inline std::string taken(const char* text) {
    const std::unique_ptr<const char[]> owner(text);
    return text != nullptr ? text : "(null)";
}

/// The text as hex digits, and as binary digits up to its first zero character.
inline bool loadAgrees(const NumberedVec& target, std::string_view text, int places, bool descending, bool byteSwap) {
    const std::string binaryText(text.substr(0, text.find('\0')));
    NumberedVec hex(target, target.numbering);
    NumberedVec binary(target, target.numbering);
    Model hexModel(target, target.numbering);
    Model binaryModel = hexModel;
    Hex2Bit::convertHexString2BitVec(&hex, text, places, descending, byteSwap, false);
    HexModel::loadHex(hexModel, std::string(text), places, descending, byteSwap);
    Hex2Bit::convertBinString2BitVec(&binary, binaryText.c_str(), places, descending);
    HexModel::loadBinary(binaryModel, binaryText, places, descending);
    return Model(hex).bytes == hexModel.bytes && Model(binary).bytes == binaryModel.bytes;
}

/// The text as plain characters.
inline bool charactersAgree(std::string_view text, bool descending, bool byteSwap) {
    std::string digits;
    for (const char character : text) {
        char printed[9];
        std::snprintf(printed, sizeof printed, "%x", static_cast<unsigned>(static_cast<signed char>(character)));
        digits += printed;
    }
    Model model(RLBitVec(4 * digits.size(), Hex2Bit::m_initValue));
    HexModel::loadHex(model, digits, static_cast<int>(4 * digits.size()), descending, byteSwap);
    return Model(*Hex2Bit::convertString2BitVec(text, descending, byteSwap)).bytes == model.bytes;
}

/// An array as text of both kinds, and as a number.
inline bool bytesAgree(const unsigned char* bytes, int bits, bool positionOrder, bool byteMode) {
    const std::string falling = HexModel::binaryText(Model(RLBitVec(bytes, static_cast<std::size_t>(bits))));
    const std::string binary = positionOrder ? HexModel::turned(falling) : falling;
    return Hex2Bit::convertBin2Int(bytes, bits) == HexModel::number(falling) &&
           Hex2Bit::convertBin2Long(bytes, bits) == HexModel::number(falling) &&
           taken(Hex2Bit::convertBinData2BinString(bytes, bits, positionOrder)) == binary &&
           taken(Hex2Bit::convertBinData2HexString(bytes, bits, positionOrder, byteMode)) ==
               HexModel::hexText(binary, byteMode);
}

/// The first characters as binary text, and as hex digits of a number, with the fill value that is set.
inline bool textAgrees(const std::string& text, int count, bool byteMode) {
    const auto characters = static_cast<std::size_t>(count);
    std::string binary(characters, '0');
    std::transform(text.begin(), text.begin() + std::min(count, static_cast<int>(text.size())), binary.begin(),
                   [](char character) { return character == '1' ? '1' : '0'; });
    Model model(RLBitVec(4 * characters, Hex2Bit::m_initValue));
    HexModel::loadHex(model, text, 4 * count, false, false);
    const int number = HexModel::number(HexModel::binaryText(model));
    return Hex2Bit::convertHexString2Int(text.c_str(), count) == number &&
           Hex2Bit::convertHexString2Long(text.c_str(), count) == number &&
           taken(Hex2Bit::convertBinString2HexString(text.c_str(), count, byteMode)) ==
               HexModel::hexText(binary, byteMode);
}

/// A vector as characters, and as hex digits from an address on.
inline bool vectorAgrees(const NumberedVec& vector, std::size_t address, unsigned bitsPerAddress, std::size_t digits,
                         bool stop) {
    const std::string binary = HexModel::binaryText(Model(vector, vector.numbering));
    std::vector<char> out(vector.length() / 8 + 1);
    const bool isWhole = Hex2Bit::convertBitVec2String(&vector, out.data(), stop);
    const std::size_t position = address * bitsPerAddress;
    return std::pair(isWhole, std::string(out.data())) == HexModel::characters(binary, stop) &&
           taken(Hex2Bit::getHexStringByHexAddress(&vector, static_cast<int>(address), static_cast<int>(digits),
                                                   static_cast<int>(bitsPerAddress))) ==
               (position < binary.size() ? HexModel::hexAt(binary, position, digits) : "(null)");
}

/// A number into the vector, taken with a sign or without, counted from either end.
inline bool numberAgrees(NumberedVec& vector, std::uint32_t value, bool isSigned, bool fromIndexZero) {
    const auto number = static_cast<int>(value);
    isSigned ? Hex2Bit::convertInt2BitVec(number, 9, &vector, fromIndexZero)
             : Hex2Bit::convertInt2BitVec(value, 9, &vector, fromIndexZero);
    Model model(RLBitVec(vector.length(), Hex2Bit::m_initValue), vector.numbering);
    HexModel::writeNumber(model, isSigned && number < 0 ? 0 : value, fromIndexZero);
    return Model(vector).bytes == model.bytes;
}

/// All of these on the input's bytes behind the first four, which tell how. The fill value stays set.
inline bool allAgree(Input input) {
    const unsigned flags = input.byte();
    const unsigned low = input.byte();
    const unsigned high = input.byte() & 0x7FU;
    const unsigned more = input.byte();
    const Numbering numbering = HexModel::numberings[(flags >> 3) % 3];
    Hex2Bit::setInitValue((flags & 0x20U) != 0);
    const bool descending = (flags & 1U) != 0;
    const bool byteSwap = (flags & 2U) != 0;
    const auto places = static_cast<int>(high << 8 | low);
    const int reached = passesOver && more >= 128 ? 0 : places;
    const RLBitVec target(static_cast<std::size_t>(reached) + more % 70, (flags & 4U) != 0);
    const std::string_view text = input.bytes();
    const auto* const bytes = reinterpret_cast<const unsigned char*>(text.data());
    const std::size_t length = 8 * text.size() - (text.empty() ? 0 : flags % 8);
    NumberedVec vector(RLBitVec(bytes, length), numbering);
    const std::uint32_t value = (flags << 24 | more << 16 | low << 8 | high) >> more % 32;
    return loadAgrees({target, numbering}, text, places, descending, byteSwap) &&
           charactersAgree(text, descending, byteSwap) &&
           bytesAgree(bytes, static_cast<int>(length), descending, byteSwap) &&
           textAgrees(input.text(), static_cast<int>(more), byteSwap) &&
           vectorAgrees(vector, low, flags % 16, more / 2 * 2, flags >= 128) &&
           numberAgrees(vector, value, descending, byteSwap);
}

}  // namespace HexChecks
