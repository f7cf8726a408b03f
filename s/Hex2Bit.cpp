// Hex2Bit: byte buffers, numbers, and the conversions back to text.
#include "Hex2Bit.h"

#include <algorithm>
#include <cmath>
#include <cstring>
#include <mutex>
#include <set>
#include <string>
#include <vector>

#include "HkStr.h"
#include "s/BitKernels.h"
#include "s/BitText.h"
#include "s/BitVecAccess.h"
#include "s/ByteTables.h"
#include "s/CallerText.h"
#include "s/UnitOrigin.h"

namespace {

constexpr UnitOrigin origin{"../s/Hex2Bit", "$Revision: 1.1 $"};

/// The first bits of the data; none when the data is null.
BitText::Run runOf(const unsigned char* data, int count) {
    return {data, 0, data != nullptr ? CallerText::size(count) : 0};
}

constexpr BitText::Digits digitsFor(bool byteMode) {
    return byteMode ? BitText::Digits::OfBytes : BitText::Digits::OfNumber;
}

constexpr BitText::Order orderFor(bool positionOrder) {
    return positionOrder ? BitText::Order::Rising : BitText::Order::Falling;
}

/// A new text of the length, terminated and yet to be written.
char* newText(std::size_t length) {
    char* const text = new char[length + 1];
    text[length] = '\0';
    return text;
}

char* newHex(BitText::Run run, BitText::Order order, bool byteMode) {
    char* const text = newText(BitText::hexLength(run.count, digitsFor(byteMode)));
    BitText::makeHex(run, order, digitsFor(byteMode), text);
    return text;
}

/// The bits of a vector as the usual numbering stores them: its own array, or a copy where it has another numbering.
class UsualBits {
public:
    explicit UsualBits(const RLBitVec& vector) : m_bytes(vector.data()) {
        if (!BitVecAccess::hasUsualNumbering(vector)) {
            m_copy = std::make_unique<RLBitVec>(vector.length());
            BitVecAccess::copyIndexes(*m_copy, 0, vector, 0, vector.length());
            m_bytes = m_copy->data();
        }
    }
    const unsigned char* bytes() const { return m_bytes; }

private:
    std::unique_ptr<RLBitVec> m_copy;
    const unsigned char* m_bytes;
};

/// Writes the value's bits from the least significant up to its highest 1, as far as the vector has indexes.
void writeNumber(RLBitVec& vector, unsigned int value, bool fromIndexZero) {
    const std::size_t length = vector.length();
    std::size_t count = 0;
    while (count < std::min<std::size_t>(length, 32) && value >> count != 0) {
        ++count;
    }
    if (BitVecAccess::hasUsualNumbering(vector)) {
        BitKernels::writeBits(BitVecAccess::bytes(vector), fromIndexZero ? length - count : 0, count,
                              fromIndexZero ? BitKernels::reverseBits(value, count) : value);
        return;
    }
    for (std::size_t bit = 0; bit < count; ++bit) {
        const std::size_t index = fromIndexZero ? bit : length - 1 - bit;
        (value >> bit & 1U) != 0 ? vector.setBit(index) : vector.clearBit(index);
    }
}

/// The number of bits that a value is given. The logarithm is rounded to single precision, where that of a value just
/// below 16, 256, ... comes out a little too large and adds four bits. It is taken in double precision first, so that
/// it is rounded the same way on every host.
int widthOf(int value) {
    constexpr double logarithmOf2 = 0.69314718055994530942;
    constexpr int widest = 32;
    if (value < 0) {
        return widest;
    }
    const float successor = static_cast<float>(value) + 1.0F;
    const auto logarithm = static_cast<float>(std::log(static_cast<double>(successor)));
    const double quotient = static_cast<double>(logarithm) / logarithmOf2;
    return (static_cast<int>(std::ceil(quotient)) + 3) / 4 * 4;
}

/// The low digits of a value in hex.
std::string hexOfNumber(unsigned int value, std::size_t digits) {
    std::string text(digits, '0');
    for (std::size_t i = digits; i-- > 0; value >>= 4) {
        text[i] = ByteTables::hexDigits[value & 15U];
    }
    return text;
}

/// What a new vector made of the value holds: the fill hides the value when it is 1.
unsigned int filledNumber(std::int32_t value) {
    return Hex2Bit::m_initValue ? ~0U : static_cast<unsigned int>(std::max(value, 0));
}

/// A copy of the text, made once for each text. It is never released: a caller may still read it while the statics of
/// the program are destroyed.
const char* keptText(std::string text) {
    struct Kept {
        std::mutex mutex;
        std::set<std::string> texts;
    };
    static Kept& kept = *new Kept;
    const std::lock_guard<std::mutex> lock(kept.mutex);
    return kept.texts.insert(std::move(text)).first->c_str();
}

}  // namespace

// ---- Byte buffers

unsigned char Hex2Bit::swapBits(unsigned char byte) {
    return ByteTables::mirroredByte[byte];
}

unsigned char* Hex2Bit::reverseBufferBits(const unsigned char* buffer, int n) {
    const std::size_t count = buffer != nullptr ? CallerText::size(n) : 0;
    auto* const result = new unsigned char[count];
    textKernels().mirrorBytes(buffer, count, result);
    return result;
}

void Hex2Bit::reverseReadBufferBits(unsigned char* buffer, int n) {
    textKernels().mirrorBytes(buffer, buffer != nullptr ? CallerText::size(n) : 0, buffer);
}

unsigned char* Hex2Bit::swapBytes(unsigned char* buffer, int n) {
    const std::size_t count = buffer != nullptr ? CallerText::size(n) : 0;
    for (std::size_t i = 0; i + 2 <= count; i += 2) {
        std::swap(buffer[i], buffer[i + 1]);
    }
    return buffer;
}

// ---- Bytes and vectors to text

char* Hex2Bit::convertBinData2BinString(const unsigned char* data, int nBits, bool positionOrder) {
    const BitText::Run run = runOf(data, nBits);
    char* const text = newText(run.count);
    BitText::makeBinary(run, orderFor(positionOrder), text);
    return text;
}

char* Hex2Bit::convertBinData2HexString(const unsigned char* data, int nBits, bool positionOrder, bool byteMode) {
    return newHex(runOf(data, nBits), orderFor(positionOrder), byteMode);
}

char* Hex2Bit::convertBinString2HexString(const char* binText, int n, bool byteMode) {
    const std::string_view text = CallerText::view(binText, CallerText::size(n));
    std::vector<unsigned char> bits((CallerText::size(n) + 7) / 8);
    BitText::packText(text, BitMark::OnlyOne, BitText::Order::Rising, bits.data());
    return newHex({bits.data(), 0, CallerText::size(n)}, BitText::Order::Rising, byteMode);
}

char* Hex2Bit::convertBinString2HexString(std::string_view binText, bool byteMode) {
    std::vector<unsigned char> bits((binText.size() + 7) / 8);
    BitText::packText(binText, BitMark::OnlyOne, BitText::Order::Rising, bits.data());
    return newHex({bits.data(), 0, binText.size()}, BitText::Order::Rising, byteMode);
}

bool Hex2Bit::convertBitVec2String(const RLBitVec* vec, char* out) {
    return convertBitVec2String(vec, out, true);
}

bool Hex2Bit::convertBitVec2String(const RLBitVec* vec, char* out, bool stopAtNonAscii) {
    if (out == nullptr) {
        return false;
    }
    *out = '\0';
    if (vec == nullptr) {
        return true;
    }
    const UsualBits bits(*vec);
    unsigned char block[512];
    std::size_t top = vec->length();
    while (top >= 8) {
        const std::size_t count = std::min(top / 8, sizeof block);
        top -= 8 * count;
        BitKernels::copyBits(block, 0, bits.bytes(), top, 8 * count);
        for (std::size_t i = count; i-- > 0;) {
            if (HkStr::IsAscii(block[i]) != 0) {
                *out = static_cast<char>(block[i]);
                out += *out != '\0' ? 1 : 0;
            } else if (stopAtNonAscii) {
                *out = '\0';
                origin.report().issueStatus(" The binary data cannot be displayed");
                return false;
            }
        }
    }
    *out = '\0';
    return true;
}

const char* Hex2Bit::getHexStringByHexAddress(const RLBitVec* vec, int address, int nDigits, int bitsPerAddress) {
    const std::int64_t first = std::int64_t{address} * bitsPerAddress;
    const std::size_t length = vec != nullptr ? vec->length() : 0;
    if (first < 0 || static_cast<std::uint64_t>(first) >= length) {
        return nullptr;
    }
    const auto start = static_cast<std::size_t>(first);
    const std::size_t digits = BitText::hexLength(4 * CallerText::size(nDigits), BitText::Digits::OfBytes);
    char* const text = newText(digits);
    std::memset(text, '0', digits);
    BitText::makeHex({UsualBits(*vec).bytes(), start, std::min(4 * CallerText::size(nDigits), length - start)},
                     BitText::Order::Rising, BitText::Digits::OfBytes, text);
    return text;
}

// ---- Text and bytes to numbers

int Hex2Bit::convertBin2Int(const unsigned char* data, int nBits) {
    const std::size_t count = std::min<std::size_t>(runOf(data, nBits).count, 31);
    return static_cast<int>(BitKernels::readBits(data, 0, count));
}

std::int32_t Hex2Bit::convertBin2Long(const unsigned char* data, int nBits) {
    return convertBin2Int(data, nBits);
}

int Hex2Bit::convertHexString2Int(const char* hexText, int nDigits) {
    const std::string_view text = CallerText::view(hexText);
    const std::size_t digits = CallerText::size(nDigits);
    std::size_t toDrop = text.size() - std::min(text.size(), digits);
    std::size_t open = digits;  // digits of the vector that are still the fill
    std::uint32_t number = 0;
    for (const char character : text) {
        const unsigned value = ByteTables::valueOf(character);
        if (value == ByteTables::notADigit) {
            continue;
        }
        if (toDrop > 0) {
            --toDrop;
            continue;
        }
        number = number << 4 | value;
        --open;
    }
    for (std::size_t i = std::min<std::size_t>(open, 8); i > 0; --i) {
        number = number << 4 | (m_initValue ? 15U : 0U);
    }
    return static_cast<int>(number & 0x7FFFFFFFU);
}

std::int32_t Hex2Bit::convertHexString2Long(const char* hexText, int nDigits) {
    return convertHexString2Int(hexText, nDigits);
}

// ---- Numbers into vectors

void Hex2Bit::convertInt2BitVec(unsigned int value, int /*unused*/, RLBitVec* vec, bool fromIndexZero) {
    if (vec != nullptr) {
        vec->LRBitVec::operator=(m_initValue);
        writeNumber(*vec, value, fromIndexZero);
    }
}

void Hex2Bit::convertInt2BitVec(unsigned int value, int unused, RLBitVec* vec) {
    convertInt2BitVec(value, unused, vec, false);
}

void Hex2Bit::convertInt2BitVec(int value, int unused, RLBitVec* vec, bool fromIndexZero) {
    convertInt2BitVec(static_cast<unsigned int>(std::max(value, 0)), unused, vec, fromIndexZero);
}

void Hex2Bit::convertInt2BitVec(int value, int unused, RLBitVec* vec) {
    convertInt2BitVec(value, unused, vec, false);
}

std::unique_ptr<RLBitVec> Hex2Bit::convertInt2BitVec(int value, int size) {
    auto vector = std::make_unique<RLBitVec>(CallerText::size(size), m_initValue);
    writeNumber(*vector, filledNumber(value), false);
    m_binData = vector.get();
    return vector;
}

std::unique_ptr<RLBitVec> Hex2Bit::convertLong2BitVec(std::int32_t value, int size) {
    return convertInt2BitVec(value, size);
}

std::unique_ptr<RLBitVec> Hex2Bit::convertInt2BitVec(int value) {
    return convertInt2BitVec(value, widthOf(value));
}

// ---- Numbers to text

const char* Hex2Bit::convertInt2HexString(int value) {
    if (value == 0) {
        return "00000000";
    }
    return keptText(hexOfNumber(filledNumber(value), static_cast<std::size_t>(widthOf(value)) / 4));
}

char* Hex2Bit::swapWord(std::int32_t value) {
    const unsigned int number = filledNumber(value);
    const std::string text = hexOfNumber(number << 16 | number >> 16, 8);
    char* const result = newText(text.size());
    text.copy(result, text.size());
    return result;
}
