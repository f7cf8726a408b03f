#include <gtest/gtest.h>

#include <cctype>
#include <cstring>
#include <memory>
#include <string>
#include <tuple>
#include <utility>

#include "HkStr.h"

namespace {

TEST(HkStr, TakesNullAsTheEmptyTextAndKeepsToTheCount) {
    constexpr const char* none = nullptr;
    char buffer[8] = "abc";
    EXPECT_EQ(HkStr::Len(none), 0U);
    EXPECT_STREQ(HkStr::Cat(buffer, none), "abc");
    EXPECT_STREQ(HkStr::NCat(buffer, none, 5), "abc");
    EXPECT_STREQ(HkStr::Copy(buffer, none), "");
    EXPECT_STREQ(HkStr::NCopy(buffer, none, 4), "");
    EXPECT_STREQ(std::unique_ptr<char[]>(HkStr::Dup(none)).get(), "");
    EXPECT_STREQ(HkStr::FindString("x", none), "x");
    char word[] = "xxxx";
    EXPECT_STREQ(HkStr::NCopy(word, "1234567", 4), "1234");
    EXPECT_STREQ(HkStr::NCat(HkStr::NCopy(word, "ab", 4), "cdef", 1), "abc");
    EXPECT_TRUE(HkStr::Copy(nullptr, "x") == nullptr && HkStr::FindChar(nullptr, 'x') == nullptr);
    EXPECT_TRUE(HkStr::FindString(none, "x") == nullptr && HkStr::SPrintf(nullptr, "%d", 1) == 0);
    EXPECT_TRUE(HkStr::ICompare(none, "") == 0 && HkStr::IMatch(none, none) != 0 && HkStr::AToL(none) == 0);
    EXPECT_TRUE(HkStr::ICompare(none, "elf") != 0 && HkStr::ICompare("elf", none) != 0);
}

TEST(HkStr, PrintsNumbersOf32BitsByLongFormats) {
    char text[80];
    const int low = -0x65432110;  // 9abcdef0
    HkStr::SPrintf(text, "l %1lx|%-9ld|%llx|%%lx|%lc", low, -1, 0x123456789ULL, 'c');
    EXPECT_STREQ(text, "l 9abcdef0|-1       |123456789|%lx|c");
}

TEST(HkStr, ComparesWithoutCase) {
    constexpr std::size_t all = std::string::npos;
    const std::tuple<const char*, const char*, std::size_t, int> cases[] = {
        {"abc", "ABC", all, 0}, {"abc", "abd", all, -1}, {"abc", "ab", all, 1}, {"", "a", all, -1},
        {"abcx", "ABCy", 3, 0}, {"abcx", "ABCy", 4, -1}, {"a", "b", 0, 0},      {"ab", "abc", 2, 0},
        {"\xe4", "\xc4", 1, 1}, {"a", "\xff", 1, -1},    {"[", "{", all, -1},   {"@", "`", all, -1},
    };
    for (const auto& [a, b, n, sign] : cases) {
        const int result = HkStr::INCompare(a, b, n);
        EXPECT_EQ((result > 0) - (result < 0), sign) << a << " " << b << " " << n;
    }
}

TEST(HkStr, MatchesAgainstPatterns) {
    const std::tuple<const char*, const char*, bool> cases[] = {
        {"", "", true},    {"12m", "*m", true},  {"zqp", "ZQ*P", true},   {"zqr12", "z*p", false},
        {"", "*", true},   {"any", "**", true},  {"12mk", "*m", false},   {"aXbYc", "*b*c", true},
        {"a", "", false},  {"abc", "ab", false}, {"zq7", "zq73*", false}, {"ZQ73X1", "zq73*", true},
        {"m", "*m", true}, {"a*c", "a*c", true}, {"zqr12p", "z*p", true}, {"abcabd", "*ab*d", true},
    };
    for (const auto& [text, pattern, isMatch] : cases) {
        EXPECT_EQ(HkStr::IMatch(text, pattern) != 0, isMatch) << text << " " << pattern;
    }
    EXPECT_EQ(HkStr::IMatch(std::string(20000, 'a').c_str(), "*a*a*a*a*b"), 0);  // no step is tried twice over
}

TEST(HkStr, ReadsLeadingNumbers) {
    const std::pair<const char*, std::int32_t> cases[] = {
        {"", 0},        {"x1", 0},    {"12ab", 12}, {"2147483647", INT32_MAX},   {"99999999999", INT32_MAX},
        {" \t\n+7", 7}, {"-12", -12}, {"007", 7},   {"2147483648", INT32_MAX},   {"-9999999999", INT32_MIN},
        {"--1", 0},     {"0", 0},     {"-0x1", 0},  {"-2147483647", -INT32_MAX}, {"-2147483648", INT32_MIN},
    };
    for (const auto& [text, value] : cases) {
        EXPECT_EQ(HkStr::AToL(text), value) << text;
        EXPECT_EQ(HkStr::AToI(text), value) << text;
    }
    EXPECT_EQ(HkStr::AToL(std::string(1 << 20, '9').c_str()), INT32_MAX);
}

TEST(HkStr, TellsEveryByteValue) {
    for (int ch = 0; ch < 256; ++ch) {
        EXPECT_EQ(HkStr::IsDigit(ch) != 0, std::isdigit(ch) != 0) << ch;
        EXPECT_EQ(HkStr::IsAscii(ch) != 0, ch < 128) << ch;
        const char byte = static_cast<char>(ch);
        EXPECT_EQ(static_cast<unsigned char>(HkStr::ToUpper(byte)), ch < 128 ? std::toupper(ch) : ch);
        EXPECT_EQ(static_cast<unsigned char>(HkStr::ToLower(byte)), ch < 128 ? std::tolower(ch) : ch);
        char text[] = {'<', byte, '\0'};
        EXPECT_EQ(HkStr::FindChar(text, byte), ch != 0 ? std::strchr(text, ch) : nullptr) << ch;
    }
    EXPECT_EQ(HkStr::IsAscii(-1), 0);
}

}  // namespace
