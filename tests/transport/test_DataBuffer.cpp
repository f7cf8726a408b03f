#include "DataBuffer.h"

#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include <limits>
#include <string>

#include "MessageRecorder.h"

namespace {

using testing::ElementsAre;

std::string bytes(DataBuffer& buffer) {
    return {buffer.getBuffer(), static_cast<std::size_t>(buffer.getLength())};
}

TEST(DataBuffer, FieldsHaveTheWireFormWhereverItGrows) {
    using namespace std::string_literals;
    const std::string expected = "\4\3\2\1\xFF\xFF\xFF\xFF\1\x7F\3\0\0\0abc\0\0\0\0\0\0\0\0xy"s;
    for (std::size_t size = 0; size <= expected.size(); ++size) {
        DataBuffer buffer(static_cast<int>(size));
        buffer.writeInt(0x01020304);
        buffer.writeInt(-1);
        buffer.writeBool(true);
        buffer.writeByte('\x7F');
        buffer.writeString("abc");
        buffer.writeString(nullptr);
        buffer.writeString("");
        buffer.write("xyz", 2);
        buffer.write("xyz", 0);
        buffer.write("xyz", -5);
        buffer.write(nullptr, 5);
        EXPECT_EQ(bytes(buffer), expected) << size;
    }
}

TEST(DataBuffer, OneCursorServesWritingAndReading) {
    DataBuffer buffer(16);
    buffer.writeInt(std::numeric_limits<int>::min());
    buffer.write("\xFF\xFE", 2);
    const DataBuffer copy(buffer);
    DataBuffer assigned(1);
    assigned = copy;
    assigned = *&assigned;
    buffer.reset();
    buffer.write("xxxxxx", 6);
    EXPECT_EQ(assigned.getLength(), 6);
    assigned.reset();
    EXPECT_EQ(assigned.getLength(), 0);
    EXPECT_EQ(assigned.readInt(), std::numeric_limits<int>::min());
    EXPECT_TRUE(assigned.readBool());
    EXPECT_FALSE(assigned.readBool());
    EXPECT_EQ(assigned.getLength(), 6);
}

TEST(DataBuffer, WhatDoesNotFitIsDroppedAndReadingStopsAtTheEnd) {
    MessageRecorder messages;
    DataBuffer buffer(-3);
    EXPECT_EQ(buffer.readInt() + buffer.readByte() + buffer.getLength(), 0);
    buffer.writeByte('a');
    messages.clear();
    buffer.write("x", std::numeric_limits<int>::max());
    EXPECT_THAT(messages.debug(), ElementsAre("Error reallocating space in DataBuffer.\n"));
    EXPECT_EQ(bytes(buffer), "a");
}

TEST(DataBuffer, ItsOwnBytesCanBeWrittenAgain) {
    DataBuffer buffer(3);
    buffer.write("ab\0", 3);
    buffer.write(buffer.getBuffer(), 3);
    EXPECT_EQ(bytes(buffer), std::string("ab\0ab\0", 6));
    DataBuffer text(3);
    text.write("ab\0", 3);
    text.writeString(text.getBuffer());
    EXPECT_EQ(bytes(text), std::string("ab\0\2\0\0\0ab", 9));
}

}  // namespace
