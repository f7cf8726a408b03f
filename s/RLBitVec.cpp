#include "RLBitVec.h"

#include <algorithm>
#include <array>
#include <cstring>
#include <utility>

#include "s/BitKernels.h"
#include "s/TextKernels.h"

namespace {

constexpr std::size_t longestNumber = 32;

std::size_t countOf(int count) {
    return count > 0 ? static_cast<std::size_t>(count) : 0;
}

const unsigned char* asBytes(const char* text) {
    return reinterpret_cast<const unsigned char*>(text);
}

}  // namespace

RLBitVec::~RLBitVec() = default;

RLBitVec& RLBitVec::operator=(bool value) {
    LRBitVec::operator=(value);
    m_forwardIndex = 0;
    m_byteMirrorIndex = 0;
    return *this;
}

RLBitVec& RLBitVec::operator=(const RLBitVec& other) {
    LRBitVec::operator=(other);
    m_forwardIndex = other.m_forwardIndex;
    m_byteMirrorIndex = other.m_byteMirrorIndex;
    return *this;
}

RLBitVec& RLBitVec::operator<<(std::size_t count) {
    LRBitVec::operator>>(count);
    return *this;
}

RLBitVec& RLBitVec::operator>>(std::size_t count) {
    LRBitVec::operator<<(count);
    return *this;
}

void RLBitVec::putBit(std::size_t index, bool value) {
    if (value) {
        setBit(index);
    } else {
        clearBit(index);
    }
}

void RLBitVec::copyIndexes(std::size_t first, const RLBitVec& source, std::size_t sourceFirst, std::size_t count) {
    if (hasUsualNumbering() && source.hasUsualNumbering()) {
        // The run's last index is its lowest storage position.
        BitKernels::copyBits(m_data, m_numberBits - first - count, source.m_data,
                             source.m_numberBits - sourceFirst - count, count);
        return;
    }
    for (std::size_t i = 0; i < count; ++i) {
        putBit(first + i, source.testBit(sourceFirst + i));
    }
}

// ---- Joining.

RLBitVec RLBitVec::joined(const RLBitVec& other) const {
    RLBitVec result(Uninitialised{}, m_numberBits + other.m_numberBits);
    // What the copies write in part only: the byte where the vectors meet, and the slack.
    result.m_data[other.m_numberBits / 8] = 0;
    std::memset(result.m_data + result.m_numberBits / 8, 0, result.nbytes() - result.m_numberBits / 8);
    result.copyIndexes(m_numberBits, other, 0, other.m_numberBits);
    result.copyIndexes(0, *this, 0, m_numberBits);
    return result;
}

RLBitVec& RLBitVec::operator+(const RLBitVec& other) const {
    return *new RLBitVec(joined(other));
}

RLBitVec& RLBitVec::operator+=(const RLBitVec& other) {
    if (other.m_numberBits == 0) {
        return *this;
    }
    RLBitVec result = m_numberBits == 0 ? RLBitVec(other) : joined(other);
    std::swap(m_data, result.m_data);
    std::swap(m_capacity, result.m_capacity);
    std::swap(m_numberBits, result.m_numberBits);
    m_forwardIndex = 0;
    m_byteMirrorIndex = 0;
    return *this;
}

// ---- Fields.

bool RLBitVec::holdsField(int start, std::size_t count) const {
    // Under the other numberings a field beyond the length would go to indexes below 0.
    const std::size_t limit = hasUsualNumbering() ? m_capacity : m_numberBits;
    const bool holds = start >= 0 && countOf(start) <= limit && count <= limit - countOf(start);
    assert(holds);
    return holds;
}

void RLBitVec::writeField(std::size_t start, const unsigned char* bits, std::size_t count) {
    if (hasUsualNumbering()) {
        BitKernels::copyBits(m_data, start, bits, 0, count);
        return;
    }
    for (std::size_t i = 0; i < count; ++i) {
        putBit(m_numberBits - start - 1 - i, (bits[i / 8] >> (i % 8) & 1) != 0);
    }
}

void RLBitVec::updateBitField(unsigned int value, int start, int count, bool msbFirst) {
    const std::size_t bits = countOf(count);
    assert(bits <= longestNumber);
    if (bits == 0 || bits > longestNumber || !holdsField(start, bits)) {
        return;
    }
    std::array<unsigned char, sizeof(BitKernels::Word)> field;
    BitKernels::storeWord(field.data(), msbFirst ? BitKernels::reverseBits(value, bits) : value);
    writeField(countOf(start), field.data(), bits);
}

void RLBitVec::updateBitField(const char* bits, int start) {
    const std::size_t count = bits != nullptr ? std::strlen(bits) : 0;
    assert(count <= longestNumber);
    if (count == 0 || count > longestNumber) {
        return;
    }
    unsigned int value = 0;
    for (std::size_t i = 0; i < count; ++i) {
        value |= static_cast<unsigned int>(bits[i] == '1') << i;
    }
    updateBitField(value, start, static_cast<int>(count), false);
}

void RLBitVec::updateBitField(const char* bytes, int start, int count, bool reverseBits) {
    const std::size_t size = (countOf(count) + 7) / 8;
    if (bytes == nullptr || size == 0 || !holdsField(start, 8 * size)) {
        return;
    }
    if (reverseBits) {
        writeField(countOf(start), asBytes(bytes), 8 * size);
        return;
    }
    std::array<unsigned char, 1024> turned;
    for (std::size_t done = 0; done < size; done += turned.size()) {
        const std::size_t part = std::min(turned.size(), size - done);
        textKernels().mirrorBytes(asBytes(bytes) + done, part, turned.data());
        writeField(countOf(start) + 8 * done, turned.data(), 8 * part);
    }
}

void RLBitVec::updateBitField(const RLBitVec* source, int start, bool) {
    if (source == nullptr || source->m_numberBits == 0 || !holdsField(start, source->m_numberBits)) {
        return;
    }
    if (source->hasUsualNumbering()) {
        writeField(countOf(start), source->m_data, source->m_numberBits);
        return;
    }
    const RLBitVec turned = RLBitVec().joined(*source);
    writeField(countOf(start), turned.m_data, turned.m_numberBits);
}

// ---- Logic.

RLBitVec operator&(const RLBitVec& a, const RLBitVec& b) {
    RLBitVec result(a);
    result &= b;
    return result;
}

RLBitVec operator!(const RLBitVec& vector) {
    RLBitVec result(RLBitVec::Uninitialised{}, vector.m_numberBits);
    result.takeComplement(vector);
    return result;
}
