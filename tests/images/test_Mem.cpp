// The reader of memory text.

#include <gtest/gtest.h>

#include <string>
#include <vector>

#include "M2IUtil_Data_Utils.h"
#include "images/Workbench.h"
#include "imagetools/MemReader.h"

namespace {

using ImageTools::MemOptions;

/// "address:bytes" for each segment, or the first problem behind "!".
std::string parsed(const std::string& text, const MemOptions& options = {}) {
    std::vector<unsigned char> bytes(text.size() / 2 + 1);
    ImageTools::SegmentMap segments;
    const std::vector<std::string> problems = ImageTools::readMem(text, options, bytes.data(), segments);
    if (!problems.empty()) {
        return '!' + problems[0];
    }
    std::string result;
    for (const ImageTools::Segment& segment : segments.all()) {
        char digits[24];
        std::snprintf(digits, sizeof digits, "%llX:", static_cast<unsigned long long>(segment.address));
        result += (result.empty() ? "" : " ") + std::string(digits);
        for (std::size_t i = 0; i < segment.size; ++i) {
            std::snprintf(digits, sizeof digits, "%02X", segment.data[i]);
            result += digits;
        }
    }
    return result;
}

TEST(Mem, TextsGiveTheirBytesOrTheirFirstMistake) {
    struct Case {
        const char* text;
        const char* result;
    };
    const Case cases[] = {
        {"", ""},
        {"@00000400 01020304 05060708", "1000:0102030405060708"},
        {"@1000 01 02 03 04", "1000:01020304"},
        {"@408 DEADBEEF", "1020:DEADBEEF"},
        {"aB_cD // 99\n/* 11 */ 2345/*x*/\r\n", "0:ABCD2345"},
        {"01 @5 @10 02", "0:01 10:02"},
        {"01 @1 02", "0:0102"},
        {"@4 0405 @2 0203 @4 0405", "4:0203 8:0405"},
        {"@FFFFFFFF FF", "FFFFFFFF:FF"},
        {"@0_1 FF", "1:FF"},
        {"/**/", ""},
        {"01\n@ 5", "!2:1: expected hexadecimal digits directly behind @"},
        {"@5g 01", "!1:1: expected hexadecimal digits behind @, not \"@5g\""},
        {"@100000000 01", "!1:1: address \"@100000000\" is past the last one, 0xFFFFFFFF"},
        {"@FFFFFFFF 0102", "!1:11: the word at address 0x1FFFFFFFE goes past the last one, 0xFFFFFFFF"},
        {"@FFFFFFFF 01 02", "!1:14: the word at address 0x100000000 goes past the last one, 0xFFFFFFFF"},
        {"0102\r03", "!2:1: a word of 2 digits, the first one has 4"},
        {"012", "!1:1: a word of 3 digits holds no whole number of bytes up to 1024"},
        {"  01x2", "!1:3: unknown bits in \"01x2\""},
        {"01\n\n  zebra!", "!3:3: unknown bits in \"zebra!\""},
        {":00000001FF", "!1:1: expected a word of hexadecimal digits or @, not \":00000001FF\""},
        {"_1", "!1:1: expected a word of hexadecimal digits or @, not \"_1\""},
        {"01 /* 02", "!1:4: the comment is not closed, expected */"},
        {"@1 01 @1 02", "!1:10: the data from here gives address 0x1 another byte than the data before"},
    };
    for (const Case& c : cases) {
        EXPECT_EQ(parsed(c.text), c.result) << c.text;
    }
}

TEST(Mem, ByteOrderAddressUnitAndUnknownBitsAreOptions) {
    EXPECT_EQ(parsed("@4 01020304", {true, false, false}), "10:04030201");
    EXPECT_EQ(parsed("@4 01020304", {false, true, false}), "4:01020304");
    EXPECT_EQ(parsed("0x Z0", {false, false, true}), "0:0FF0");
}

TEST(Mem, MistakesAreReportedUpToALimit) {
    Workbench bench;
    std::string text;
    for (int i = 0; i < 100; ++i) {
        text += "oops\n";
    }
    M2IUtil_BramMapping::M2IUtil_Results result{};
    const M2IUtil_Data_Utils reader(bench.write("a.mem", text).c_str(), DUMP_BY_DEFAULT, &result);
    EXPECT_EQ(result, M2IUtil_BramMapping::M2IUTIL_MALFORMED);
    EXPECT_EQ(bench.messages.info().size(), 20U);
    EXPECT_EQ(bench.said().substr(0, 11), "a.mem:1:1: ");
}

}  // namespace
