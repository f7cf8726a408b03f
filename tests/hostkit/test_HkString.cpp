#include <gtest/gtest.h>

#include <cstring>

#include "HkString.h"

namespace {

TEST(HkString, IsOnePointerWithTheLengthWordBeforeTheText) {
    static_assert(sizeof(HkString) == sizeof(char*));
    const HkString text("abc");
    const char* pointer = nullptr;
    std::memcpy(&pointer, &text, sizeof pointer);
    std::uint32_t length = 0;
    std::memcpy(&length, pointer - 4, sizeof length);
    EXPECT_STREQ(pointer, "abc");
    EXPECT_EQ(length, 3U);
}

}  // namespace
