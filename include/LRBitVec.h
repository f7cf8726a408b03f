/// @file
/// The growable bit string whose index 0 is the first bit of its byte array.
#pragma once

#include <cassert>
#include <cstddef>
#include <cstdint>
#include <functional>
#include <iosfwd>
#include <memory>
#include <string_view>

#include "BitOperations.h"
#include "TessalExport.h"

namespace HostKit {
class HkStream;
}

/// A growable bit string: a byte array with a length and a capacity, both counted in bits.
///
/// **Numbering.** Storage position p is bit p & 7, least significant first, of byte p >> 3. In this class an index is
/// a storage position: index 0 is the least significant bit of byte 0, index 7 its most significant one, index 8 the
/// least significant bit of byte 1. Text that is appended from left to right lies at rising indexes.
///
/// **Capacity.** The array has (capacity + 7) >> 3 bytes. The bits between length and capacity, the slack, have no
/// meaning: comparisons, searches and counts ignore them, operations on whole bytes change them.
///
/// **Limits.** Single-bit access asserts in debug builds that the bit lies inside the array, and checks nothing in
/// release builds. Everything that works on more than one bit stays inside the array in release builds too: a length
/// beyond the capacity is refused and leaves the vector as it is, a capacity below the length cuts the length, a shift
/// by more than the length clears the vector, and a shorter right-hand side combines with the bytes that it has; in
/// debug builds each of these is an assertion. So the length never exceeds the capacity. A size whose bytes cannot be
/// counted throws std::bad_array_new_length, a failed allocation the allocator's exception; either leaves the vector
/// as it was.
///
/// An object belongs to one thread at a time.
class TESSAL_API LRBitVec {
public:
    /// Capacity 8, length 0.
    LRBitVec();
    /// @p length bits of 0; the capacity is the length + 7.
    explicit LRBitVec(std::size_t length);
    /// @p length bits, and the slack behind them, of @p value; the capacity is the length + 7.
    LRBitVec(std::size_t length, bool value);
    /// The first @p length bits of @p bytes, taken as whole bytes; the capacity is the length + 7. Null bytes stand
    /// for zeros.
    LRBitVec(const unsigned char* bytes, std::size_t length);
    /// The same length, capacity and array content, slack included.
    LRBitVec(const LRBitVec& other);
    /// Takes over the array; the other vector is left with length and capacity 0.
    LRBitVec(LRBitVec&& other) noexcept;

    // The order of the virtual operations is fixed: it is the order of their slots.

    virtual ~LRBitVec();
    /// The lowest storage position within the length that holds 0; 0xFFFFFFFF when there is none.
    virtual std::size_t firstFalse() const;
    /// The lowest storage position within the length that holds 1; 0xFFFFFFFF when there is none.
    virtual std::size_t firstTrue() const;
    /// Makes the length @p length, which must not exceed the capacity, and gives all bits the value.
    virtual void setSize(std::size_t length, bool value);
    /// Makes the length @p length; beyond the capacity the capacity becomes twice the length. Bits that come to lie
    /// within the length keep what the slack held.
    virtual void resize(std::size_t length);
    /// Appends one bit; always true. The capacity doubles one bit before it is used up. Amortised O(1).
    virtual bool addBit(bool value);
    /// Moves all bits @p count positions up, towards the end, and clears the lowest ones; always true.
    virtual bool rightShift(std::size_t count);
    /// Moves all bits @p count positions down, towards position 0, and clears the highest ones; always true.
    virtual bool leftShift(std::size_t count);
    /// Appends all bits of the other vector, which may be this one. The capacity becomes the sum of both lengths
    /// plus 64, also when it was greater. A class that overrides addBit() sees each bit in order.
    virtual LRBitVec& concatenate(const LRBitVec& other);
    /// The number of bits in use.
    virtual std::size_t length() const;
    /// Sets the length and nothing else; it must not exceed the capacity.
    virtual void setNumberBits(std::size_t length);
    /// The bytes that hold the length.
    virtual std::size_t getNumberBytes() const;
    /// The whole bytes of the capacity.
    virtual std::size_t nfull() const;
    /// The size of the array in bytes.
    virtual std::size_t nbytes() const;
    /// The number of bits that the array is taken to hold.
    virtual std::size_t getCapacity() const;
    /// True when the lengths and all bits within them are the same.
    virtual bool isEqual(const LRBitVec& other) const;
    /// Appends hex text as addHex() does.
    virtual LRBitVec& operator+=(const char* hexText);
    /// Appends one bit by addBit().
    virtual LRBitVec& operator+=(bool value);
    /// Appends all bits of the other vector as concatenate() does.
    virtual LRBitVec& operator+=(const LRBitVec& other);
    /// Appends four bits for each digit, the most significant first: `1f` appends 0001 1111, which makes the byte
    /// 0xF8. A character that is no hex digit appends the bits of the digit before it once more, and nothing when no
    /// digit came before it. A class that overrides addBit() sees each bit in order. Null is the empty text.
    virtual void addHex(const char* hexText);
    /// Takes over the other vector's bits. Vectors of different length: capacity, length and array of the other one.
    /// Vectors of the same length: this one keeps its capacity and takes the bytes that both arrays hold. When either
    /// vector has no array, nothing happens.
    virtual LRBitVec& operator=(const LRBitVec& other);
    /// As isEqual(), which is called through its slot.
    virtual bool operator==(const LRBitVec& other) const;
    virtual bool operator!=(const LRBitVec& other) const;
    /// Combines the bytes that hold this length with those of the other vector, which must be at least as long.
    virtual LRBitVec& operator&=(const LRBitVec& other);
    virtual LRBitVec& operator^=(const LRBitVec& other);
    virtual LRBitVec& operator|=(const LRBitVec& other);
    /// The bit at the index, which is cut to 32 bits.
    virtual BitOperations operator[](std::size_t index);
    /// The same as operator[].
    virtual BitOperations operator()(std::size_t index);
    /// Prints the bits from position 0 up through the message manager, in brackets, with a line end after each
    /// @p bitsPerLine bits (none when that is below 1, which is not allowed). With @p debug all messages but the
    /// first two are debug messages.
    virtual void printData(bool debug, int bitsPerLine);

    /// The byte array; null when the capacity is 0.
    const unsigned char* data() const { return m_data; }
    /// Sets the capacity and keeps the leading bytes; added bytes, and the bits of the last byte that the former
    /// capacity did not cover, become 0. The capacity must not be below the length.
    void setCapacity(std::size_t bits);
    void setBit(std::size_t index) { setPosition(index); }
    void clearBit(std::size_t index) { clearPosition(index); }
    bool testBit(std::size_t index) const { return testPosition(index); }
    /// As rightShift().
    LRBitVec& operator>>(std::size_t count);
    /// As leftShift().
    LRBitVec& operator<<(std::size_t count);
    /// Gives every bit of the array, slack included, the value; the length stays.
    LRBitVec& operator=(bool value);

    /// The number of bits within the length that hold 1.
    std::size_t count() const;
    /// As addHex(const char*), for a text of known length.
    void addHex(std::string_view hexText);

protected:
    struct Uninitialised {};
    /// As LRBitVec(length), with an array whose content is yet to be written.
    LRBitVec(Uninitialised, std::size_t length);
    /// Fills such an array with the complements of the other's bytes, and zeros behind them.
    void takeComplement(const LRBitVec& other);

    bool holdsPosition(std::size_t position) const { return position >> 3 < (m_capacity + 7) >> 3; }
    void setPosition(std::size_t position) {
        assert(holdsPosition(position));
        m_data[position >> 3] = static_cast<unsigned char>(m_data[position >> 3] | 1U << (position & 7));
    }
    void clearPosition(std::size_t position) {
        assert(holdsPosition(position));
        m_data[position >> 3] = static_cast<unsigned char>(m_data[position >> 3] & ~(1U << (position & 7)));
    }
    bool testPosition(std::size_t position) const {
        assert(holdsPosition(position));
        return (m_data[position >> 3] >> (position & 7) & 1) != 0;
    }

    std::uint64_t m_capacity;
    std::uint64_t m_numberBits;
    unsigned char* m_data;

private:
    friend class BitVecAccess;
    friend TESSAL_API LRBitVec operator!(const LRBitVec& vector);
    friend TESSAL_API void operator!(LRBitVec& vector);

    /// The part of addBit() that is seldom needed: makes room for one more bit.
    void makeRoom();
    /// True when addBit() is known to be the one of this class, so that bits may be appended in blocks.
    bool appendsInBlocks() const;
    void append(const LRBitVec& other);
    void appendHex(std::string_view hexText);
    /// The capacity that appending @p count bits one by one leads to.
    std::size_t capacityAfterAppending(std::size_t count) const;
    /// The array for another capacity: the first @p kept bits and what lies from bit @p resumed on are as
    /// setCapacity() makes them; the bytes between are left to the caller.
    unsigned char* arrayFor(std::size_t capacity, std::size_t kept, std::size_t resumed) const;
    /// Sets the capacity; an array of another size is made by arrayFor(), and the former one is handed over.
    std::unique_ptr<unsigned char[]> replaceArray(std::size_t capacity, std::size_t kept, std::size_t resumed);
    std::size_t bytesToCombine(const LRBitVec& other) const;
};

inline bool LRBitVec::addBit(bool value) {
    if (m_numberBits + 1 >= m_capacity) {
        makeRoom();
    }
    unsigned char& byte = m_data[m_numberBits >> 3];
    const unsigned bit = m_numberBits & 7;
    byte = static_cast<unsigned char>((byte & ~(1U << bit)) | static_cast<unsigned>(value) << bit);
    ++m_numberBits;
    return true;
}

inline LRBitVec& LRBitVec::operator+=(bool value) {
    addBit(value);
    return *this;
}

inline std::size_t LRBitVec::length() const {
    return m_numberBits;
}
inline std::size_t LRBitVec::getNumberBytes() const {
    return (m_numberBits + 7) >> 3;
}
inline std::size_t LRBitVec::nfull() const {
    return m_capacity >> 3;
}
inline std::size_t LRBitVec::nbytes() const {
    return (m_capacity + 7) >> 3;
}
inline std::size_t LRBitVec::getCapacity() const {
    return m_capacity;
}

inline BitOperations LRBitVec::operator[](std::size_t index) {
    assert(holdsPosition(static_cast<unsigned int>(index)));
    return {m_data, static_cast<unsigned int>(index)};
}

inline BitOperations LRBitVec::operator()(std::size_t index) {
    return LRBitVec::operator[](index);
}

/// The bits that both vectors hold: a copy of @p a, combined with @p b.
TESSAL_API LRBitVec operator&(const LRBitVec& a, const LRBitVec& b);
/// A new vector of the same length whose bytes are the complements.
TESSAL_API LRBitVec operator!(const LRBitVec& vector);
/// Complements the bytes that hold the length in place.
TESSAL_API void operator!(LRBitVec& vector);
/// Prints the bits from position 0 up in brackets, 25 a line.
TESSAL_API HostKit::HkStream& operator<<(HostKit::HkStream& stream, LRBitVec vector);
/// The same on a standard stream.
TESSAL_API std::ostream& operator<<(std::ostream& stream, const LRBitVec& vector);

/// Vectors that are equal have the same hash; the slack does not count.
/// @cond
template <>
struct TESSAL_API std::hash<LRBitVec> {
    std::size_t operator()(const LRBitVec& vector) const noexcept;
};
/// @endcond
