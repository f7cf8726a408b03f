// Any text loaded as hex and as binary text, in any order and numbering, against the model.
#include "Hex2Bit.h"
#include "fuzz/Fuzz.h"
#include "hex/HexModel.h"

namespace {

/// A vector and the model of it, which are filled alike.
struct Pair {
    Pair(std::size_t length, Numbering numbering, bool fill)
        : vector(length, numbering, fill), model(HexModel::modelOf(vector, numbering)) {}
    void requireEqual() const { require(HexModel::arrayOf(vector) == model.bytes); }

    HexModel::NumberedVec vector;
    Model model;
};

}  // namespace

void fuzz(Input input) {
    const unsigned flags = input.byte();
    const unsigned lowPlaces = input.byte();
    const auto places = static_cast<int>(lowPlaces | (input.byte() & 0x1F) << 8);
    const std::size_t length = static_cast<std::size_t>(places) + input.byte() % 32;
    const std::string text(input.bytes());
    const Numbering numbering = HexModel::numberings[(flags >> 3) % 3];
    const bool descending = (flags & 1U) != 0;
    const bool byteSwap = (flags & 2U) != 0;
    const bool fill = (flags & 4U) != 0;

    Pair hex(length, numbering, fill);
    Hex2Bit::convertHexString2BitVec(&hex.vector, input.bytes(), places, descending, byteSwap, false);
    HexModel::loadHex(hex.model, text, places, descending, byteSwap);
    hex.requireEqual();

    Pair binary(length, numbering, fill);
    Hex2Bit::convertBinString2BitVec(&binary.vector, text.c_str(), places, descending);
    HexModel::loadBinary(binary.model, text.c_str(), places, descending);
    binary.requireEqual();

    std::string digits;
    for (const char character : text) {
        char printed[9];
        std::snprintf(printed, sizeof printed, "%x", static_cast<unsigned>(static_cast<signed char>(character)));
        digits += printed;
    }
    Model expected = HexModel::modelOf(RLBitVec(4 * digits.size()));
    HexModel::loadHex(expected, digits, static_cast<int>(4 * digits.size()), descending, byteSwap);
    require(HexModel::arrayOf(*Hex2Bit::convertString2BitVec(input.bytes(), descending, byteSwap)) == expected.bytes);
}
