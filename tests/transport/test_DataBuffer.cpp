#include "DataBuffer.h"

#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include <limits>
#include <string>

#include "MessageRecorder.h"

namespace {

using testing::ElementsAre;
using testing::IsEmpty;

std::string bytes(DataBuffer& buffer) {
    return {buffer.getBuffer(), static_cast<std::size_t>(buffer.getLength())};
}

TEST(DataBuffer, FieldsHaveTheWireForm) {
    DataBuffer buffer(64);
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
    using namespace std::string_literals;
    EXPECT_EQ(bytes(buffer), "\4\3\2\1\xFF\xFF\xFF\xFF\1\x7F\3\0\0\0abc\0\0\0\0\0\0\0\0xy"s);
}

TEST(DataBuffer, OneCursorServesWritingAndReading) {
    DataBuffer buffer(16);
    buffer.writeInt(std::numeric_limits<int>::min());
    buffer.writeByte('\xFF');
    buffer.writeByte('\xFE');
    buffer.reset();
    EXPECT_EQ(buffer.getLength(), 0);
    EXPECT_EQ(buffer.readInt(), std::numeric_limits<int>::min());
    EXPECT_TRUE(buffer.readBool());
    EXPECT_FALSE(buffer.readBool());
    EXPECT_EQ(buffer.getLength(), 6);
}

TEST(DataBuffer, GrowsByTheFieldAndAMargin) {
    MessageRecorder messages;
    DataBuffer buffer(16);
    buffer.write("0123456789abcd", 12);
    buffer.writeInt(1);
    EXPECT_THAT(messages.all(), IsEmpty()) << "exactly full";
    buffer.reset();
    buffer.write("0123456789abcd", 14);
    buffer.writeInt(2);
    EXPECT_THAT(messages.debug(), ElementsAre("New buffer size = 1044. Requested size = 18.\n"));
    EXPECT_EQ(bytes(buffer).substr(0, 14), "0123456789abcd");
    messages.clear();
    DataBuffer empty(0);
    empty.writeString(std::string(1030, 'x').c_str());
    EXPECT_THAT(messages.debug(), ElementsAre("New buffer size = 1028. Requested size = 4.\n",
                                              "New buffer size = 3082. Requested size = 1034.\n"));
    empty.writeBool(true);
    EXPECT_EQ(empty.getLength(), 1035);
}

TEST(DataBuffer, WhatDoesNotFitIsDroppedAndReadingStopsAtTheEnd) {
    MessageRecorder messages;
    DataBuffer buffer(-3);
    EXPECT_EQ(buffer.readInt(), 0);
    EXPECT_FALSE(buffer.readBool());
    EXPECT_EQ(buffer.readByte(), 0);
    EXPECT_EQ(buffer.getLength(), 0);
    const char byte = 'x';
    buffer.writeByte('a');
    messages.clear();
    buffer.write(&byte, std::numeric_limits<int>::max());
    EXPECT_THAT(messages.debug(), ElementsAre("Error reallocating space in DataBuffer.\n"));
    EXPECT_EQ(bytes(buffer), "a");
}

TEST(DataBuffer, CopiesAreIndependent) {
    DataBuffer buffer(8);
    buffer.writeInt(5);
    DataBuffer copy(buffer);
    DataBuffer assigned(1);
    assigned = buffer;
    assigned = *&assigned;
    buffer.reset();
    buffer.writeInt(6);
    for (DataBuffer* other : {&copy, &assigned}) {
        EXPECT_EQ(other->getLength(), 4);
        other->reset();
        EXPECT_EQ(other->readInt(), 5);
    }
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
