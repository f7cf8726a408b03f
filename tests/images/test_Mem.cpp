// The reader of memory text.

#include <gtest/gtest.h>

#include <iomanip>
#include <iterator>
#include <sstream>
#include <string>
#include <vector>

#include "images/Workbench.h"
#include "imagetools/MemReader.h"

namespace {

using ImageTools::MemOptions;

/// "address:bytes" for each segment, or the first problem behind "!".
std::string parsed(const std::string& text, const MemOptions& options) {
    std::vector<unsigned char> bytes(text.size() / 2 + 1);
    ImageTools::SegmentMap segments;
    const std::vector<std::string> problems = ImageTools::readMem(text, options, bytes.data(), segments);
    if (!problems.empty()) {
        return '!' + problems[0];
    }
    std::ostringstream result;
    result << std::hex << std::uppercase << std::setfill('0');
    for (const ImageTools::Segment& segment : segments.all()) {
        result << (result.tellp() > 0 ? " " : "") << segment.address << ':';
        for (std::size_t i = 0; i < segment.size; ++i) {
            result << std::setw(2) << static_cast<unsigned>(segment.data[i]);
        }
    }
    return result.str();
}

TEST(Mem, TextsGiveTheirBytesOrTheirFirstMistake) {
    struct Case {
        const char* text;
        const char* result;
        MemOptions options = {};
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
        {"@4 01020304", "10:04030201", {true, false, false}},
        {"@4 01020304", "4:01020304", {false, true, false}},
        {"0x Z0", "0:0FF0", {false, false, true}},
    };
    for (const Case& c : cases) {
        EXPECT_EQ(parsed(c.text, c.options), c.result) << c.text;
    }
}

TEST(Mem, MistakesAreReportedUpToALimit) {
    const Workbench bench;
    std::ostringstream text;
    std::fill_n(std::ostream_iterator<const char*>(text), 100, "oops\n");
    EXPECT_EQ(SectionRange(bench.write("a.mem", text.str())).result, M2IUtil_BramMapping::M2IUTIL_MALFORMED);
    EXPECT_EQ(bench.messages.info().size(), 20U);
    EXPECT_EQ(bench.said().substr(0, 11), "a.mem:1:1: ");
}

}  // namespace
