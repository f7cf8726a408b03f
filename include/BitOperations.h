/// @file
/// One bit of a bit vector, as the indexing operators give it.
#pragma once

#include "TessalExport.h"

/// Stands for one bit of a byte array: reading and writing it reads and writes the bit.
///
/// It refers into the array of the vector that gave it, and is invalid once that array is reallocated: by appending,
/// by a change of capacity, or by an assignment to the vector.
class TESSAL_API BitOperations {
public:
    /// The bit of number index & 7, least significant first, in the byte base[index >> 3].
    BitOperations(unsigned char* base, unsigned int index)
        : m_byte(base + (index >> 3)), m_mask(static_cast<unsigned char>(1U << (index & 7U))) {}
    /// Refers to the same bit.
    BitOperations(const BitOperations&) = default;

    /// True when the bit is set.
    operator bool() const { return (*m_byte & m_mask) != 0; }

    /// Sets or clears the bit and gives the value.
    bool operator=(bool value) {
        write(value);
        return value;
    }
    /// Takes over the value of the other bit, not its place.
    BitOperations& operator=(const BitOperations& other) {
        if (this != &other) {
            write(other);
        }
        return *this;
    }

    /// Clears the bit when @p value is false.
    void operator&=(bool value) { write(*this && value); }
    /// Sets the bit when @p value is true.
    void operator|=(bool value) { write(*this || value); }
    /// Toggles the bit when @p value is true.
    void operator^=(bool value) { write(*this != value); }

private:
    void write(bool value) { *m_byte = static_cast<unsigned char>(value ? *m_byte | m_mask : *m_byte & ~m_mask); }

    unsigned char* m_byte;
    unsigned char m_mask;
};
