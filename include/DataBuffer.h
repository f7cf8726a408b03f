/// @file
/// A growing byte buffer in which a message is put together or taken apart.
#pragma once

#include <cstddef>

#include "TessalExport.h"
#include "WireForm.h"

/// A message in memory, in the same form in which TessalSocket and TessalPipe send its fields one by one.
///
/// There is one cursor, for writing and reading alike. A number takes 4 bytes, least significant first; a truth value
/// one byte; a string the number of its characters and then these, without a terminator; raw bytes just themselves. No
/// field carries a tag.
///
/// A write that does not fit makes the buffer grow by what it asks for and 1024 bytes more. Where that fails, a debug
/// line says so and the field is dropped: cursor, bytes and capacity stay. A read past the capacity gives 0 or false
/// and leaves the cursor. Copies are independent.
class TESSAL_API DataBuffer {
public:
    /// @param size bytes to begin with; a negative size counts as 0
    explicit DataBuffer(int size);
    DataBuffer(const DataBuffer& other);
    DataBuffer& operator=(const DataBuffer& other);
    ~DataBuffer();

    /// The cursor: behind writes the size of the message, behind reset() and reads what was read.
    int getLength() const { return m_position; }
    /// The bytes, owned by the buffer; the pointer changes when it grows. Null while it has no capacity.
    char* getBuffer() { return m_data; }
    /// Brings the cursor to the beginning; bytes and capacity stay.
    void reset() { m_position = 0; }

    void writeInt(int value) {
        int place = m_position;  // in a register: bytes stored may alias the fields, for all that the compiler knows
        if (hasSpace(WireForm::intSize)) {
            WireForm::storeInt(m_data + place, value);
            place += WireForm::intSize;
        }
        m_position = place;
    }
    void writeBool(bool value) { writeByte(value ? 1 : 0); }
    void writeByte(char value) {
        int place = m_position;
        if (hasSpace(1)) {
            m_data[place++] = value;
        }
        m_position = place;
    }
    /// Writes @p length bytes, which may be the buffer's own; nothing for null or a length below 1.
    void write(const char* data, int length);
    /// Null is written as the empty text. A text whose bytes find no space leaves the length alone written.
    void writeString(const char* text);

    int readInt() {
        if (!holds(WireForm::intSize)) {
            return 0;
        }
        m_position += WireForm::intSize;
        return WireForm::loadInt(m_data + m_position - WireForm::intSize);
    }
    /// The lowest bit of the byte.
    bool readBool() { return WireForm::loadBool(readByte()); }
    char readByte() { return holds(1) ? m_data[m_position++] : '\0'; }

private:
    bool holds(int size) const { return m_position <= m_capacity - size; }
    bool hasSpace(int size) { return holds(size) || checkBufferSpace(size); }
    /// Grows, for a write that does not fit; false where that fails.
    bool checkBufferSpace(int requested);
    std::ptrdiff_t placeInside(const char* data) const;

    int m_position = 0;
    int m_capacity = 0;
    char* m_data = nullptr;
};
