#include "LRBitVec.h"

#include <algorithm>
#include <array>
#include <cstring>
#include <limits>
#include <memory>
#include <new>
#include <ostream>
#include <string>
#include <typeinfo>

#include "HkStream.h"
#include "RLBitVec.h"
#include "s/BitKernels.h"
#include "s/BitText.h"
#include "s/UnitOrigin.h"

namespace {

constexpr UnitOrigin origin{"../s/LRBitVec", "$Revision: 1.1 $"};

constexpr std::size_t defaultCapacity = 8;
constexpr std::size_t constructionReserve = 7;
constexpr std::size_t concatenationReserve = 64;
constexpr std::size_t noPosition = 0xFFFFFFFFU;
constexpr unsigned char allOnes = 0xFF;

/// The sum of two bit counts, as long as its bytes can be counted.
std::size_t checkedSum(std::size_t a, std::size_t b) {
    constexpr std::size_t limit = std::numeric_limits<std::size_t>::max() - 7;
    if (a > limit || b > limit - a) {
        throw std::bad_array_new_length();
    }
    return a + b;
}

std::size_t bytesFor(std::size_t bits) {
    return checkedSum(bits, 0) / 8 + (bits % 8 != 0 ? 1 : 0);
}

unsigned char* newArray(std::size_t bytes) {
    return bytes != 0 ? new unsigned char[bytes] : nullptr;
}

/// Copies and sets bytes as the standard functions do, which do not allow null for no bytes.
void copyBytes(unsigned char* target, const unsigned char* source, std::size_t count) {
    if (count != 0) {
        std::memcpy(target, source, count);
    }
}
void setBytes(unsigned char* target, unsigned char value, std::size_t count) {
    if (count != 0) {
        std::memset(target, value, count);
    }
}

/// The bits in brackets, 25 a line.
std::string framedText(const LRBitVec& vector) {
    constexpr std::size_t bitsPerLine = 25;
    std::string text = "[\n  ";
    text.reserve(2 * vector.length() + vector.length() / 8 + 16);
    for (std::size_t i = 0; i < vector.length(); ++i) {
        text += vector.LRBitVec::testBit(i) ? "1 " : "0 ";
        if ((i + 1) % bitsPerLine == 0) {
            text += "\n  ";
        }
    }
    return text += "\n]\n";
}

}  // namespace

LRBitVec::LRBitVec() : m_capacity(defaultCapacity), m_numberBits(0), m_data(new unsigned char[1]()) {}

LRBitVec::LRBitVec(Uninitialised, std::size_t length)
    : m_capacity(checkedSum(length, constructionReserve)),
      m_numberBits(length),
      m_data(newArray(bytesFor(m_capacity))) {}

LRBitVec::LRBitVec(std::size_t length) : LRBitVec(length, false) {}

LRBitVec::LRBitVec(std::size_t length, bool value) : LRBitVec(Uninitialised{}, length) {
    *this = value;
}

LRBitVec::LRBitVec(const unsigned char* bytes, std::size_t length) : LRBitVec(Uninitialised{}, length) {
    const std::size_t held = bytes != nullptr ? LRBitVec::getNumberBytes() : 0;
    copyBytes(m_data, bytes, held);
    setBytes(m_data + held, 0, LRBitVec::nbytes() - held);
}

LRBitVec::LRBitVec(const LRBitVec& other)
    : m_capacity(other.m_capacity), m_numberBits(other.m_numberBits), m_data(newArray(bytesFor(other.m_capacity))) {
    copyBytes(m_data, other.m_data, bytesFor(m_capacity));
}

LRBitVec::LRBitVec(LRBitVec&& other) noexcept
    : m_capacity(other.m_capacity), m_numberBits(other.m_numberBits), m_data(other.m_data) {
    other.m_capacity = 0;
    other.m_numberBits = 0;
    other.m_data = nullptr;
}

LRBitVec::~LRBitVec() {
    delete[] m_data;
}

// ---- Growth and length.

unsigned char* LRBitVec::arrayFor(std::size_t capacity, std::size_t kept, std::size_t resumed) const {
    const std::size_t bytes = bytesFor(capacity);
    const std::size_t common = std::min(bytes, bytesFor(m_capacity));
    const std::size_t keptEnd = std::min(bytesFor(kept), common);
    const std::size_t resumedFrom = std::max(resumed / 8, keptEnd);
    const std::size_t commonEnd = std::max(resumedFrom, common);
    unsigned char* const array = newArray(bytes);
    copyBytes(array, m_data, keptEnd);
    if (commonEnd > resumedFrom) {  // else there may be no array to point into
        copyBytes(array + resumedFrom, m_data + resumedFrom, commonEnd - resumedFrom);
    }
    setBytes(array + commonEnd, 0, bytes - commonEnd);
    const std::size_t lastByte = m_capacity / 8;
    if (capacity > m_capacity && m_capacity % 8 != 0 && (lastByte < keptEnd || lastByte >= resumedFrom)) {
        BitKernels::fillBits(array, m_capacity, 8 - m_capacity % 8, false);
    }
    return array;
}

std::unique_ptr<unsigned char[]> LRBitVec::replaceArray(std::size_t capacity, std::size_t kept, std::size_t resumed) {
    std::unique_ptr<unsigned char[]> former;
    if (bytesFor(capacity) != bytesFor(m_capacity)) {
        unsigned char* const array = arrayFor(capacity, kept, resumed);
        former.reset(m_data);
        m_data = array;
    } else if (capacity > m_capacity && m_capacity % 8 != 0) {
        BitKernels::fillBits(m_data, m_capacity, 8 - m_capacity % 8, false);
    }
    m_capacity = capacity;
    return former;
}

void LRBitVec::setCapacity(std::size_t bits) {
    assert(bits >= m_numberBits);
    replaceArray(bits, bits, 0);
    m_numberBits = std::min<std::size_t>(m_numberBits, bits);
}

void LRBitVec::resize(std::size_t length) {
    if (length > m_capacity) {
        setCapacity(checkedSum(length, length));
    }
    m_numberBits = length;
}

void LRBitVec::setSize(std::size_t length, bool value) {
    assert(length <= m_capacity);
    if (length > m_capacity) {
        return;
    }
    m_numberBits = length;
    BitKernels::fillBits(m_data, 0, length, value);
}

void LRBitVec::setNumberBits(std::size_t length) {
    assert(length <= m_capacity);
    if (length <= m_capacity) {
        m_numberBits = length;
    }
}

// ---- Appending.

void LRBitVec::makeRoom() {
    if (m_capacity == 0) {
        setCapacity(defaultCapacity);
    }
    if (m_numberBits + 1 >= m_capacity) {
        setCapacity(checkedSum(m_capacity, m_capacity));
    }
}

bool LRBitVec::appendsInBlocks() const {
    const std::type_info& type = typeid(*this);
    return type == typeid(LRBitVec) || type == typeid(RLBitVec);
}

std::size_t LRBitVec::capacityAfterAppending(std::size_t count) const {
    if (count == 0) {
        return m_capacity;
    }
    std::size_t capacity = m_capacity != 0 ? m_capacity : defaultCapacity;
    const std::size_t end = checkedSum(m_numberBits, count);
    // The capacity doubles at the first length that finds less than two free bits, and not again before the next one.
    for (std::size_t from = m_numberBits; std::max(from, capacity - 1) < end;) {
        from = std::max(from, capacity - 1) + 1;
        capacity = checkedSum(capacity, capacity);
    }
    return capacity;
}

void LRBitVec::append(const LRBitVec& other) {
    const std::size_t added = other.m_numberBits;
    const std::size_t sum = checkedSum(m_numberBits, added);
    const std::size_t capacity = checkedSum(sum, concatenationReserve);
    if (!appendsInBlocks()) {
        setCapacity(capacity);
        for (std::size_t i = 0; i < added; ++i) {
            addBit(other.testPosition(i));
        }
        return;
    }
    const unsigned char* const bits = other.m_data;
    const auto former = replaceArray(capacity, m_numberBits, sum);  // which may hold the bits to append
    BitKernels::copyBits(m_data, m_numberBits, bits, 0, added);
    m_numberBits = sum;
}

void LRBitVec::appendHex(std::string_view hexText) {
    const auto* const begin = hexText.data();
    const auto* const first = std::find_if(begin, begin + hexText.size(), BitText::isHexDigit);
    hexText.remove_prefix(static_cast<std::size_t>(first - begin));
    constexpr std::size_t chunk = BitText::longestAppended;
    std::array<unsigned char, chunk / 2> bytes;
    char last = '0';
    const bool inBlocks = appendsInBlocks();
    std::unique_ptr<unsigned char[]> former;  // which may hold the text
    if (inBlocks) {
        const std::size_t added = hexText.size() * 4;
        former = replaceArray(capacityAfterAppending(added), m_numberBits, m_numberBits + added);
    }
    for (; !hexText.empty(); hexText.remove_prefix(std::min(chunk, hexText.size()))) {
        const std::string_view digits = hexText.substr(0, chunk);
        BitText::packHexRepeating(bytes.data(), digits, last);
        if (inBlocks) {
            BitKernels::copyBits(m_data, m_numberBits, bytes.data(), 0, 4 * digits.size());
            m_numberBits += 4 * digits.size();
            continue;
        }
        for (std::size_t i = 0; i < 4 * digits.size(); ++i) {
            addBit((bytes[i / 8] >> (i % 8) & 1) != 0);
        }
    }
}

LRBitVec& LRBitVec::concatenate(const LRBitVec& other) {
    append(other);
    return *this;
}

LRBitVec& LRBitVec::operator+=(const LRBitVec& other) {
    append(other);
    return *this;
}

LRBitVec& LRBitVec::operator+=(const char* hexText) {
    appendHex(hexText != nullptr ? hexText : "");
    return *this;
}

void LRBitVec::addHex(const char* hexText) {
    appendHex(hexText != nullptr ? hexText : "");
}

void LRBitVec::addHex(std::string_view hexText) {
    appendHex(hexText);
}

// ---- Shifts.

bool LRBitVec::rightShift(std::size_t count) {
    *this >> count;
    return true;
}

bool LRBitVec::leftShift(std::size_t count) {
    *this << count;
    return true;
}

LRBitVec& LRBitVec::operator>>(std::size_t count) {
    assert(count <= m_numberBits || m_numberBits == 0);
    count = std::min<std::size_t>(count, m_numberBits);
    BitKernels::copyBits(m_data, count, m_data, 0, m_numberBits - count);
    BitKernels::fillBits(m_data, 0, count, false);
    return *this;
}

LRBitVec& LRBitVec::operator<<(std::size_t count) {
    assert(count <= m_numberBits || m_numberBits == 0);
    count = std::min<std::size_t>(count, m_numberBits);
    BitKernels::copyBits(m_data, 0, m_data, count, m_numberBits - count);
    BitKernels::fillBits(m_data, m_numberBits - count, count, false);
    return *this;
}

// ---- Comparing, searching, counting.

bool LRBitVec::isEqual(const LRBitVec& other) const {
    return m_numberBits == other.m_numberBits && BitKernels::equalBits(m_data, other.m_data, 0, m_numberBits);
}

bool LRBitVec::operator==(const LRBitVec& other) const {
    return isEqual(other);
}

bool LRBitVec::operator!=(const LRBitVec& other) const {
    return !isEqual(other);
}

std::size_t LRBitVec::firstTrue() const {
    const std::size_t position = BitKernels::findBit(m_data, 0, m_numberBits, true);
    return position < m_numberBits ? position : noPosition;
}

std::size_t LRBitVec::firstFalse() const {
    const std::size_t position = BitKernels::findBit(m_data, 0, m_numberBits, false);
    return position < m_numberBits ? position : noPosition;
}

std::size_t LRBitVec::count() const {
    return BitKernels::countOnes(m_data, 0, m_numberBits);
}

std::size_t std::hash<LRBitVec>::operator()(const LRBitVec& vector) const noexcept {
    return BitKernels::hashBits(vector.data(), 0, vector.length());
}

// ---- Assignment and logic.

// The same array means the same object.
LRBitVec& LRBitVec::operator=(const LRBitVec& other) {  // NOLINT(bugprone-unhandled-self-assignment)
    if (m_data == nullptr || other.m_data == nullptr || m_data == other.m_data) {
        return *this;
    }
    if (m_numberBits != other.m_numberBits) {
        if (nbytes() != other.nbytes()) {
            unsigned char* const array = newArray(other.nbytes());
            delete[] m_data;
            m_data = array;
        }
        m_capacity = other.m_capacity;
        m_numberBits = other.m_numberBits;
    }
    copyBytes(m_data, other.m_data, std::min(nbytes(), other.nbytes()));
    return *this;
}

LRBitVec& LRBitVec::operator=(bool value) {
    setBytes(m_data, value ? allOnes : 0, LRBitVec::nbytes());
    return *this;
}

LRBitVec& LRBitVec::operator&=(const LRBitVec& other) {
    BitKernels::andBytes(m_data, other.m_data, bytesToCombine(other));
    return *this;
}

LRBitVec& LRBitVec::operator^=(const LRBitVec& other) {
    BitKernels::xorBytes(m_data, other.m_data, bytesToCombine(other));
    return *this;
}

LRBitVec& LRBitVec::operator|=(const LRBitVec& other) {
    BitKernels::orBytes(m_data, other.m_data, bytesToCombine(other));
    return *this;
}

std::size_t LRBitVec::bytesToCombine(const LRBitVec& other) const {
    assert(other.m_numberBits >= m_numberBits);
    return std::min(bytesFor(m_numberBits), bytesFor(other.m_capacity));
}

void LRBitVec::takeComplement(const LRBitVec& other) {
    const std::size_t held = bytesFor(m_numberBits);
    BitKernels::complementBytes(m_data, other.m_data, held);
    setBytes(m_data + held, 0, bytesFor(m_capacity) - held);
}

LRBitVec operator&(const LRBitVec& a, const LRBitVec& b) {
    LRBitVec result(a);
    result &= b;
    return result;
}

LRBitVec operator!(const LRBitVec& vector) {
    LRBitVec result(LRBitVec::Uninitialised{}, vector.m_numberBits);
    result.takeComplement(vector);
    return result;
}

void operator!(LRBitVec& vector) {
    BitKernels::complementBytes(vector.m_data, vector.m_data, bytesFor(vector.m_numberBits));
}

// ---- Printing.

void LRBitVec::printData(bool debug, int bitsPerLine) {
    assert(bitsPerLine != 0);
    const auto print = [debug](const char* format, int character) {
        if (debug) {
            HkMessageManager::debugStub(format, character);
        } else {
            origin.report().issueStatus(format, character);
        }
    };
    origin.report().issueStatus("[\n");
    origin.report().issueStatus("  ");
    int inLine = 0;
    for (std::size_t i = 0; i < m_numberBits; ++i) {
        print("%c ", testPosition(i) ? '1' : '0');
        if (++inLine == bitsPerLine) {
            print("\n  ", 0);
            inLine = 0;
        }
    }
    print("\n]\n", 0);
}

HkStream& operator<<(HkStream& stream, LRBitVec vector) {
    return stream << framedText(vector).c_str();
}

std::ostream& operator<<(std::ostream& stream, const LRBitVec& vector) {
    return stream << framedText(vector);
}
