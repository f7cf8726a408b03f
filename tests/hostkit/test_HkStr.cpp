#include <gtest/gtest.h>

#include <algorithm>
#include <cctype>
#include <cstdlib>
#include <cstring>
#include <memory>
#include <string>
#include <tuple>

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
    HkStr::SPrintf(text, "l %1lx|%-9ld|%llx|%%lx|%lc", 0x9abcdef0U, -1, 0x123456789ULL, 'c');
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
        {"", "", true},   {"zqr12p", "Z*P", true}, {"zqr12", "z*p", false},   {"12mk", "*m", false},
        {"", "**", true}, {"aXbYc", "*b*c", true}, {"abcabd", "*ab*d", true}, {"zq7", "zq73*", false},
        {"a", "", false}, {"abc", "ab", false},    {"a*c", "a*c", true},      {"ZQ73X1", "zq73*", true},
    };
    for (const auto& [text, pattern, isMatch] : cases) {
        EXPECT_EQ(HkStr::IMatch(text, pattern) != 0, isMatch) << text << " " << pattern;
    }
    EXPECT_EQ(HkStr::IMatch(std::string(20000, 'a').c_str(), "*a*a*a*a*b"), 0);  // no step is tried twice over
}

TEST(HkStr, ReadsLeadingNumbersUpToTheLimitsOf32Bits) {
    const std::string endless(1 << 20, '9');
    for (const char* text : {"", "x1", "--1", "-0x1", "12ab", " \t\n\v\f\r+7", "007", "-12", "2147483647", "2147483648",
                             "-2147483647", "-2147483648", "-2147483649", "99999999999", endless.c_str()}) {
        const long long number = std::strtoll(text, nullptr, 10);
        EXPECT_EQ(HkStr::AToL(text), std::clamp<long long>(number, INT32_MIN, INT32_MAX)) << text;
        EXPECT_EQ(HkStr::AToI(text), HkStr::AToL(text)) << text;
    }
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
