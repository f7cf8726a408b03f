// The plain bit vector that the fast ones are compared with: every rule bit by bit, nothing clever. Its operations are
// those of LRBitVec under the same names.
#pragma once

#include <algorithm>
#include <functional>
#include <string_view>
#include <tuple>
#include <vector>

#include "RLBitVec.h"

enum class Numbering { Storage, Usual, Forward, Mirrored };

/// An RLBitVec whose numbering can be chosen.
struct NumberedVec : RLBitVec {
    NumberedVec(const RLBitVec& bits, Numbering chosen) : RLBitVec(bits), numbering(chosen) {
        const bool isMirrored = chosen == Numbering::Mirrored;
        m_byteMirrorIndex = isMirrored ? 7 : 0;
        // Beside the mirror the forward index does not count: mirrored vectors of odd lengths have both.
        m_forwardIndex = chosen == Numbering::Forward || (isMirrored && bits.length() % 2 != 0) ? 1 : 0;
    }
    NumberedVec(std::size_t length, Numbering chosen) : NumberedVec(RLBitVec(length), chosen) {}

    const Numbering numbering;
};

/// The value of a hex digit; -1 for any other character.
inline int digitValue(char character) {
    const std::size_t place = std::string_view("0123456789abcdefABCDEF").find(character);
    return place == std::string_view::npos ? -1 : static_cast<int>(place < 16 ? place : place - 6);
}

struct Model {
    std::size_t capacity = 8;
    std::size_t length = 0;
    std::vector<unsigned char> bytes{0};
    Numbering numbering = Numbering::Storage;
    bool appendsInverted = false;

    Model() = default;
    Model(const Model&) = default;
    explicit Model(const RLBitVec& vector, Numbering chosen = Numbering::Usual, bool inverts = false)
        : capacity(vector.getCapacity()),
          length(vector.length()),
          bytes(vector.data(), vector.data() + vector.nbytes()),
          numbering(chosen),
          appendsInverted(inverts) {}

    std::tuple<std::size_t, std::size_t, std::vector<unsigned char>> state() const { return {length, capacity, bytes}; }
    bool bit(std::size_t p) const { return (bytes.at(p / 8) >> (p % 8) & 1) != 0; }
    void put(std::size_t p, bool value) {
        unsigned char& byte = bytes.at(p / 8);
        byte = static_cast<unsigned char>(value ? byte | 1 << (p % 8) : byte & ~(1 << (p % 8)));
    }
    std::size_t place(std::size_t index) const {
        return numbering == Numbering::Mirrored ? index / 8 * 8 + (7 - index % 8)
               : numbering == Numbering::Usual  ? length - 1 - index
                                                : index;
    }
    bool read(std::size_t index) const { return index < length && bit(place(index)); }
    void write(std::size_t index, bool value) { index < length ? put(place(index), value) : void(); }

    void setCapacity(std::size_t bits) {
        const std::size_t former = capacity;
        capacity = bits;
        bytes.resize((bits + 7) / 8, 0);
        for (std::size_t p = former; bits > former && p % 8 != 0; ++p) {
            put(p, false);
        }
    }
    void addBit(bool value) {
        if (capacity == 0) {
            setCapacity(8);
        }
        if (length >= capacity - 1) {
            setCapacity(2 * capacity);
        }
        put(length++, value != appendsInverted);
    }
    void concatenate(const Model& other) {
        const std::vector<bool> added = other.bits();
        setCapacity(length + added.size() + 64);
        for (const bool value : added) {
            addBit(value);
        }
    }
    void addHex(std::string_view text) {
        int value = -1;
        for (const char character : text) {
            value = digitValue(character) >= 0 ? digitValue(character) : value;
            for (int bit = 3; bit >= 0 && value >= 0; --bit) {
                addBit((value >> bit & 1) != 0);
            }
        }
    }
    void operator+=(bool value) { addBit(value); }
    void operator+=(const Model& other) { concatenate(other); }
    void operator+=(const char* text) { addHex(text); }
    void setSize(std::size_t bits, bool value) {
        length = bits;
        for (std::size_t i = 0; i < bits; ++i) {
            put(i, value);
        }
    }
    void resize(std::size_t bits) {
        length = bits;
        if (bits > capacity) {
            setCapacity(2 * bits);
        }
    }
    void rightShift(std::size_t n) {
        for (std::size_t i = length; i-- > 0;) {
            put(i, i >= n && bit(i - n));
        }
    }
    void leftShift(std::size_t n) {
        for (std::size_t i = 0; i < length; ++i) {
            put(i, i + n < length && bit(i + n));
        }
    }
    Model& operator=(const Model& other) {
        if (!bytes.empty() && !other.bytes.empty()) {
            capacity = length != other.length ? other.capacity : capacity;
            bytes.resize((capacity + 7) / 8);
            length = other.length;
            std::copy_n(other.bytes.begin(), std::min(bytes.size(), other.bytes.size()), bytes.begin());
        }
        return *this;
    }
    void operator=(bool value) { std::fill(bytes.begin(), bytes.end(), static_cast<unsigned char>(value ? 0xFF : 0)); }
    void operator!() {
        combine(*this, [](int own, int) { return ~own; });
    }
    void operator&=(const Model& other) { combine(other, std::bit_and<>()); }
    void operator^=(const Model& other) { combine(other, std::bit_xor<>()); }
    void operator|=(const Model& other) { combine(other, std::bit_or<>()); }

    std::vector<bool> bits() const {
        std::vector<bool> all;
        for (std::size_t p = 0; p < length; ++p) {
            all.push_back(bit(p));
        }
        return all;
    }
    Model joined(const Model& other) const {
        Model result(RLBitVec(length + other.length));
        for (std::size_t i = 0; i < result.length; ++i) {
            result.write(i, i < length ? read(i) : other.read(i - length));
        }
        return result;
    }
    // The operators that an RLBitVec has itself; in += the other one's bits come behind the last index.
    void join(const Model& other) {
        if (other.length > 0) {
            Model sum = length > 0 ? joined(other) : other;
            std::tie(capacity, length) = std::tuple(sum.capacity, sum.length);
            bytes.swap(sum.bytes);
        }
    }
    void operator<<(std::size_t n) { rightShift(n); }
    void operator>>(std::size_t n) { leftShift(n); }

private:
    template <class Operation>
    void combine(const Model& other, Operation operation) {
        for (std::size_t i = 0; i < (length + 7) / 8; ++i) {
            bytes[i] = static_cast<unsigned char>(operation(bytes[i], other.bytes.at(i)));
        }
    }
};
