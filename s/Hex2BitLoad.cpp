// The loading half of Hex2Bit: hex text, binary text and plain text into vectors and byte arrays.
#include <algorithm>
#include <cassert>
#include <limits>
#include <string>

#include "Hex2Bit.h"
#include "s/BitText.h"
#include "s/BitVecAccess.h"
#include "s/ByteTables.h"
#include "s/CallerText.h"

namespace {

/// The bytes as printf's "%x" prints them when they are taken as numbers with a sign.
std::string hexOfBytes(std::string_view bytes) {
    std::string hex;
    hex.reserve(2 * bytes.size());
    for (const char character : bytes) {
        const auto byte = static_cast<unsigned char>(character);
        const auto& pair = ByteTables::hexPair[byte];
        if (byte >= 0x80) {
            hex += "ffffff";
        }
        hex.append(byte < 0x10 ? &pair[1] : pair.data(), byte < 0x10 ? 1 : 2);
    }
    return hex;
}

/// A new array laid out and filled as RLBitVec(size, m_initValue) is.
std::unique_ptr<unsigned char[]> filledArray(std::size_t size) {
    RLBitVec vector(size, Hex2Bit::m_initValue);
    return BitVecAccess::release(vector);
}

std::unique_ptr<RLBitVec> loadNew(std::string_view hexText, std::size_t size, bool descending, bool byteSwap) {
    auto vector = std::make_unique<RLBitVec>(size, Hex2Bit::m_initValue);
    BitText::loadHex(BitVecAccess::bytes(*vector), size, hexText, {size, descending}, byteSwap);
    return vector;
}

}  // namespace

bool Hex2Bit::m_initValue = false;
RLBitVec* Hex2Bit::m_binData = nullptr;

void Hex2Bit::convertHexString2BitVec(RLBitVec* vec, const char* hexString, int size, bool descending, bool byteSwap,
                                      bool initialise) {
    convertHexString2BitVec(vec, CallerText::view(hexString), size, descending, byteSwap, initialise);
}

void Hex2Bit::convertHexString2BitVec(RLBitVec* vec, std::string_view hexString, int size, bool descending,
                                      bool byteSwap, bool initialise) {
    if (vec == nullptr) {
        return;
    }
    assert(CallerText::size(size) <= vec->length());
    if (initialise) {
        *vec = m_initValue;
    }
    if (BitVecAccess::hasUsualNumbering(*vec)) {
        BitText::loadHex(BitVecAccess::bytes(*vec), vec->length(), hexString, {CallerText::size(size), descending},
                         byteSwap);
    } else {
        loadBitByBit(*vec, hexString, size, descending, byteSwap);
    }
}

std::unique_ptr<RLBitVec> Hex2Bit::convertHexString2BitVec(const char* hexString, int size, bool descending,
                                                           bool byteSwap, bool leftFill) {
    return convertHexString2BitVec(CallerText::view(hexString), size, descending, byteSwap, leftFill);
}

std::unique_ptr<RLBitVec> Hex2Bit::convertHexString2BitVec(std::string_view hexString, int size, bool descending,
                                                           bool byteSwap, bool leftFill) {
    const std::size_t digits = CallerText::size(size) / 4;
    if (!leftFill || hexString.size() >= digits) {
        return loadNew(hexString, CallerText::size(size), descending, byteSwap);
    }
    std::string filled(digits - hexString.size(), '0');
    filled += hexString;
    return loadNew(filled, CallerText::size(size), descending, byteSwap);
}

std::unique_ptr<unsigned char[]> Hex2Bit::convertHexString2BinData(const char* hexString, int size, bool descending,
                                                                   bool byteSwap) {
    auto bytes = filledArray(CallerText::size(size));
    BitText::loadHex(bytes.get(), CallerText::size(size), CallerText::view(hexString),
                     {CallerText::size(size), descending}, byteSwap);
    return bytes;
}

void Hex2Bit::convertBpiHexString2BitVec(RLBitVec* vec, const char* hexString, int size, bool descending) {
    convertHexString2BitVec(vec, hexString, size, descending, false, false);
}

void Hex2Bit::convertBinString2BitVec(RLBitVec* vec, const char* binString, int size, bool descending) {
    if (vec == nullptr) {
        return;
    }
    assert(CallerText::size(size) <= vec->length());
    const std::string_view text = CallerText::view(binString, CallerText::size(size));
    if (BitVecAccess::hasUsualNumbering(*vec)) {
        BitText::loadBinary(BitVecAccess::bytes(*vec), vec->length(), text, {CallerText::size(size), descending});
        return;
    }
    for (std::size_t k = 0; k < text.size(); ++k) {
        const std::size_t index = descending ? CallerText::size(size) - 1 - k : k;
        if (text[k] != '0' && index < vec->length()) {
            vec->setBit(index);
        }
    }
}

std::unique_ptr<RLBitVec> Hex2Bit::convertBinString2BitVec(const char* binString, int size, bool descending) {
    auto vector = std::make_unique<RLBitVec>(CallerText::size(size), m_initValue);
    convertBinString2BitVec(vector.get(), binString, size, descending);
    return vector;
}

std::unique_ptr<unsigned char[]> Hex2Bit::convertBinString2BinData(const char* binString, int size, bool descending) {
    auto bytes = filledArray(CallerText::size(size));
    BitText::loadBinary(bytes.get(), CallerText::size(size), CallerText::view(binString, CallerText::size(size)),
                        {CallerText::size(size), descending});
    return bytes;
}

std::unique_ptr<RLBitVec> Hex2Bit::convertString2BitVec(const char* text, int count, bool descending, bool byteSwap) {
    return convertString2BitVec(CallerText::bytes(text, count), descending, byteSwap);
}

std::unique_ptr<RLBitVec> Hex2Bit::convertString2BitVec(std::string_view text, bool descending, bool byteSwap) {
    const std::string hex = hexOfBytes(text);
    return loadNew(hex, 4 * hex.size(), descending, byteSwap);
}

void Hex2Bit::convertString2BitVec(RLBitVec* vec, const char* text, int count, bool descending, bool byteSwap) {
    if (vec == nullptr) {
        return;
    }
    const std::string hex = hexOfBytes(CallerText::bytes(text, count));
    const std::size_t size = std::min(4 * hex.size(), vec->length());
    constexpr std::size_t greatest = std::numeric_limits<int>::max();
    convertHexString2BitVec(vec, hex, static_cast<int>(std::min(size, greatest)), descending, byteSwap, false);
}

// ---- Vectors of another numbering, bit by bit. `index` counts from 1; the bits that have no index are counted off in
// ---- `limit`.

bool Hex2Bit::checkIfValidIndex(int& index, bool descending, int& limit) {
    if (descending ? index <= limit : index > limit) {
        return true;
    }
    const int step = descending ? 1 : -1;
    index += step;
    limit += step;
    return false;
}

void Hex2Bit::loadBitByBit(RLBitVec& vec, std::string_view hexString, int size, bool descending, bool byteSwap) {
    constexpr std::size_t greatest = std::numeric_limits<int>::max();
    const int textBits = static_cast<int>(std::min(4 * hexString.size(), greatest));
    size = std::max(size, 0);
    int index = descending ? size : 1;
    int limit = descending ? size - std::max(textBits - size, 0) : textBits - size;
    for (std::size_t i = 0; i < hexString.size() && index >= 1 && index <= size; ++i) {
        const std::size_t partner = i ^ 1U;
        const unsigned value = ByteTables::valueOf(hexString[byteSwap && partner < hexString.size() ? partner : i]);
        for (unsigned bit = 0; bit < 4 && value != ByteTables::notADigit; ++bit) {
            const std::size_t target = CallerText::size(index) - 1;
            if (checkIfValidIndex(index, descending, limit) && target < vec.length()) {
                const bool one = (value >> (byteSwap ? bit : 3 - bit) & 1U) != 0;
                one ? vec.setBit(target) : vec.clearBit(target);
            }
            index += descending ? -1 : 1;
        }
    }
}
