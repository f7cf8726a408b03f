/// @file
/// The bit string that is read from its other end: index 0 is the last storage position.
#pragma once

#include "LRBitVec.h"

/// An LRBitVec whose indexes run from the other end.
///
/// Storage, capacity and growth are those of LRBitVec. In a vector of L bits index i is storage position L - i - 1, so
/// index 0 is the left end of the bit string as it is read and index L - 1 the least significant bit of data()[0]. In
/// a vector of 8 bits setBit(0) makes data()[0] 0x80. A bit's index changes with the length.
///
/// Only single-bit access, the operations declared here and what is built on them (Register, Hex2Bit) work with
/// indexes. Everything inherited works on storage positions: addBit() writes what becomes index 0, firstTrue() gives a
/// storage position, rightShift() does what operator<< does, and printing runs from the highest index down.
///
/// A derived class can choose two other numberings by the protected fields: m_byteMirrorIndex, where an index is
/// mirrored inside its byte, and m_forwardIndex, where it is the storage position. Both fields are 0 after every
/// constructor, also the copying ones; assignment copies them. Runs of bits are moved in words under the usual
/// numbering and bit by bit under the others.
class TESSAL_API RLBitVec : public LRBitVec {
public:
    RLBitVec() = default;
    explicit RLBitVec(std::size_t length) : LRBitVec(length) {}
    RLBitVec(std::size_t length, bool value) : LRBitVec(length, value) {}
    RLBitVec(const unsigned char* bytes, std::size_t length) : LRBitVec(bytes, length) {}
    /// The same bytes, so the bits read in the opposite direction.
    RLBitVec(const LRBitVec& other) : LRBitVec(other) {}
    RLBitVec(const RLBitVec& other) : LRBitVec(other) {}
    RLBitVec(RLBitVec&& other) noexcept : LRBitVec(static_cast<LRBitVec&&>(other)) {}
    ~RLBitVec() override;

    /// The bit at the index; its storage position is cut to 32 bits.
    BitOperations operator[](std::size_t index) override {
        const auto position = static_cast<unsigned int>(translate(index));
        assert(holdsPosition(position));
        return {m_data, position};
    }
    /// The same as operator[].
    BitOperations operator()(std::size_t index) override { return RLBitVec::operator[](index); }

    void setBit(std::size_t index) { setPosition(translate(index)); }
    void clearBit(std::size_t index) { clearPosition(translate(index)); }
    bool testBit(std::size_t index) const { return testPosition(translate(index)); }

    /// Fills the array as LRBitVec does and returns to the usual numbering.
    RLBitVec& operator=(bool value);
    /// Assigns as LRBitVec does and takes over the other vector's numbering.
    RLBitVec& operator=(const RLBitVec& other);

    /// Moves all bits towards higher storage positions: the bit at index i moves to index i - count, and zeros come
    /// in at the right end.
    RLBitVec& operator<<(std::size_t count);
    /// Moves all bits towards lower storage positions, which is to the right; zeros come in at the left end.
    RLBitVec& operator>>(std::size_t count);

    /// A new vector, owned by the caller, of this vector's bits followed, in index order, by the other's, which so lie
    /// at the low storage positions. It has the usual numbering; each operand is read in its own.
    RLBitVec& operator+(const RLBitVec& other) const;
    /// Puts the other's bits behind this vector's in index order, as operator+ does. An empty vector takes a copy of
    /// the other; an empty other changes nothing.
    RLBitVec& operator+=(const RLBitVec& other);
    using LRBitVec::operator+=;

    // The field operations write consecutive bits from storage position `start` up under the usual numbering: `start`
    // counts from the right end. In general the first bit goes to index length - start - 1 and the others to falling
    // indexes. The field must lie inside the capacity; one that does not is refused and changes nothing.

    /// Writes @p count bits of @p value, at most 32: from bit count - 1 down with @p msbFirst, otherwise from bit 0 up.
    /// A count below 1 writes nothing.
    void updateBitField(unsigned int value, int start, int count, bool msbFirst);
    /// The same, so that a constant 0 is a number and not a null text.
    void updateBitField(int value, int start, int count, bool msbFirst) {
        updateBitField(static_cast<unsigned int>(value), start, count, msbFirst);
    }
    /// Writes one bit for each of the at most 32 characters: `1` is 1, every other character 0.
    void updateBitField(const char* bits, int start);
    /// Writes the whole bytes that hold @p count bits, each from its most significant bit down, or from its least
    /// significant bit up with @p reverseBits.
    void updateBitField(const char* bytes, int start, int count, bool reverseBits);
    /// Writes all bits of the source from its highest index down to index 0; under the usual numbering of both, source
    /// position t goes to position start + t. The source may be this vector. The last argument is not used.
    void updateBitField(const RLBitVec* source, int start, bool unused);

protected:
    /// The storage position of the index.
    std::size_t translate(std::size_t index) const {
        // The usual numbering first, by one test, which compilers take out of loops.
        if (hasUsualNumbering()) {
            return m_numberBits - index - 1;
        }
        return m_byteMirrorIndex != 0 ? index ^ 7U : index;
    }

    std::uint64_t m_forwardIndex = 0;     ///< not 0: an index is the storage position
    std::uint64_t m_byteMirrorIndex = 0;  ///< not 0, and before the other: an index is mirrored inside its byte

private:
    friend class BitVecAccess;
    friend TESSAL_API RLBitVec operator!(const RLBitVec& vector);

    RLBitVec(Uninitialised tag, std::size_t length) : LRBitVec(tag, length) {}

    bool hasUsualNumbering() const { return m_forwardIndex == 0 && m_byteMirrorIndex == 0; }
    /// This vector's bits followed by the other's, in index order.
    RLBitVec joined(const RLBitVec& other) const;
    /// Gives index first + k the value of the source's index sourceFirst + k, for all k below count.
    void copyIndexes(std::size_t first, const RLBitVec& source, std::size_t sourceFirst, std::size_t count);
    void putBit(std::size_t index, bool value);
    /// True when the field lies inside the vector, which the caller has to see to.
    bool holdsField(int start, std::size_t count) const;
    /// Writes a field that lies inside the vector, storage position 0 of @p bits first.
    void writeField(std::size_t start, const unsigned char* bits, std::size_t count);
};

/// The bits that both vectors of the same length hold, in the usual numbering.
TESSAL_API RLBitVec operator&(const RLBitVec& a, const RLBitVec& b);
/// A new vector of the same length and the usual numbering whose bytes are the complements.
TESSAL_API RLBitVec operator!(const RLBitVec& vector);

/// @cond
template <>
struct TESSAL_API std::hash<RLBitVec> : std::hash<LRBitVec> {};
/// @endcond
