// Any text loaded as hex and as binary text, in any order and numbering, against the model.

#include <cstdint>
#include <cstdlib>
#include <string>

#include "Hex2Bit.h"
#include "hex/HexModel.h"

namespace {

using HexModel::Numbering;

void require(bool holds) {
    if (!holds) {
        std::abort();
    }
}

/// A vector of ones or zeros, and the model of it.
struct Pair {
    Pair(std::size_t length, Numbering numbering, bool fill) : vector(length, numbering), model(vector, numbering) {
        vector.LRBitVec::operator=(fill);
        model = HexModel::Vector(vector, numbering);
    }
    HexModel::NumberedVec vector;
    HexModel::Vector model;
};

}  // namespace

extern "C" int LLVMFuzzerTestOneInput(const std::uint8_t* data, std::size_t size) {
    if (size < 4) {
        return 0;
    }
    const unsigned flags = data[0];
    const int places = data[1] | (data[2] & 0x1F) << 8;
    const std::string text(reinterpret_cast<const char*>(data) + 4, size - 4);
    const std::string untilZero = text.c_str();
    const auto numbering = static_cast<Numbering>((flags >> 3) % 3);
    const bool descending = (flags & 1U) != 0;
    const bool byteSwap = (flags & 2U) != 0;
    const bool fill = (flags & 4U) != 0;

    Pair hex(static_cast<std::size_t>(places) + data[3] % 32, numbering, fill);
    Hex2Bit::convertHexString2BitVec(&hex.vector, std::string_view(text), places, descending, byteSwap, false);
    HexModel::loadHex(hex.model, text, places, descending, byteSwap);
    require(hex.model.matches(hex.vector));

    Pair binary(static_cast<std::size_t>(places) + data[3] % 32, numbering, fill);
    Hex2Bit::convertBinString2BitVec(&binary.vector, untilZero.c_str(), places, descending);
    HexModel::loadBinary(binary.model, untilZero, places, descending);
    require(binary.model.matches(binary.vector));

    const auto plain = Hex2Bit::convertString2BitVec(std::string_view(text), descending, byteSwap);
    std::string digits;
    for (const char character : text) {
        char printed[9];
        std::snprintf(printed, sizeof printed, "%x", static_cast<unsigned>(static_cast<signed char>(character)));
        digits += printed;
    }
    Pair expected(4 * digits.size(), Numbering::Usual, false);
    HexModel::loadHex(expected.model, digits, static_cast<int>(4 * digits.size()), descending, byteSwap);
    require(expected.model.matches(*plain));
    return 0;
}
