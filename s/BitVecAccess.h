// What the units that move runs of bits may reach inside the bit vectors.
#pragma once

#include <cstddef>
#include <memory>

#include "RLBitVec.h"

class BitVecAccess {
public:
    /// The byte array, for writing.
    static unsigned char* bytes(LRBitVec& vector) { return vector.m_data; }

    /// True when index i of the vector is storage position length - i - 1, so that an index run is a storage run.
    static bool hasUsualNumbering(const RLBitVec& vector) { return vector.hasUsualNumbering(); }

    /// Gives index first + k of the target the value of the source's index sourceFirst + k, for all k below count,
    /// whatever the numberings. Both runs must lie inside their vectors.
    static void copyIndexes(RLBitVec& target, std::size_t first, const RLBitVec& source, std::size_t sourceFirst,
                            std::size_t count) {
        target.copyIndexes(first, source, sourceFirst, count);
    }

    /// A vector as RLBitVec(length) gives it, whose array content, slack included, is yet to be written.
    static RLBitVec uninitialised(std::size_t length) { return RLBitVec(RLBitVec::Uninitialised{}, length); }

    /// Hands over the byte array and leaves the vector with length and capacity 0.
    static std::unique_ptr<unsigned char[]> release(LRBitVec& vector) {
        std::unique_ptr<unsigned char[]> array(vector.m_data);
        vector.m_data = nullptr;
        vector.m_capacity = 0;
        vector.m_numberBits = 0;
        return array;
    }
};
