#include <gtest/gtest.h>

#include <cctype>
#include <cstring>
#include <memory>
#include <string>

#include "HkStr.h"

namespace {

constexpr const char* none = nullptr;

TEST(HkStr, TakesNullAsTheEmptyText) {
    char buffer[8] = "abc";
    EXPECT_EQ(HkStr::Len(none), 0U);
    EXPECT_STREQ(HkStr::Cat(buffer, none), "abc");
    EXPECT_STREQ(HkStr::NCat(buffer, none, 5), "abc");
    EXPECT_STREQ(HkStr::Copy(buffer, none), "");
    EXPECT_STREQ(HkStr::NCopy(buffer, none, 4), "");
    EXPECT_EQ(HkStr::Copy(nullptr, "x"), nullptr);
    EXPECT_STREQ(std::unique_ptr<char[]>(HkStr::Dup(none)).get(), "");
    EXPECT_EQ(HkStr::FindChar(nullptr, 'x'), nullptr);
    EXPECT_EQ(HkStr::FindString(none, "x"), nullptr);
    EXPECT_STREQ(HkStr::FindString("x", none), "x");
    EXPECT_EQ(HkStr::ICompare(none, ""), 0);
    EXPECT_NE(HkStr::ICompare(none, "elf"), 0);
    EXPECT_NE(HkStr::ICompare("elf", none), 0);
    EXPECT_EQ(HkStr::AToL(none), 0);
    EXPECT_NE(HkStr::IMatch(none, none), 0);
    EXPECT_EQ(HkStr::SPrintf(nullptr, "%d", 1), 0);
}

TEST(HkStr, CopiesAndAppendsUpToACount) {
    char word[5] = {'x', 'x', 'x', 'x', '\0'};
    EXPECT_STREQ(HkStr::NCopy(word, "1234567", 4), "1234");
    EXPECT_STREQ(HkStr::NCopy(word, "ab", 4), "ab");
    EXPECT_STREQ(HkStr::NCat(word, "cdef", 1), "abc");
    EXPECT_STREQ(HkStr::Cat(word, "d"), "abcd");
    const std::unique_ptr<char[]> copy(HkStr::Dup("abcd"));
    EXPECT_STREQ(copy.get(), "abcd");
    EXPECT_EQ(HkStr::FindChar(word, 'c'), word + 2);
    EXPECT_EQ(HkStr::FindChar(word, '\0'), nullptr);
    EXPECT_EQ(HkStr::FindString(word, "bc"), word + 1);
}

TEST(HkStr, ComparesWithoutCase) {
    struct Case {
        const char* a;
        const char* b;
        std::size_t n;
        int sign;
    };
    const std::size_t all = std::string::npos;
    const Case cases[] = {
        {"abc", "ABC", all, 0}, {"abc", "abd", all, -1}, {"abc", "ab", all, 1}, {"", "a", all, -1},
        {"abcx", "ABCy", 3, 0}, {"abcx", "ABCy", 4, -1}, {"a", "b", 0, 0},      {"ab", "abc", 2, 0},
        {"\xe4", "\xc4", 1, 1}, {"a", "\xff", 1, -1},    {"[", "{", all, -1},   {"@", "`", all, -1},
    };
    for (const Case& c : cases) {
        const int result = HkStr::INCompare(c.a, c.b, c.n);
        EXPECT_EQ((result > 0) - (result < 0), c.sign) << c.a << " " << c.b << " " << c.n;
    }
}

TEST(HkStr, MatchesAgainstPatterns) {
    struct Case {
        const char* text;
        const char* pattern;
        bool isMatch;
    };
    const Case cases[] = {
        {"ZQ73X144", "zq73*", true},
        {"zq7", "zq73*", false},
        {"zqr12p", "zqr*p", true},
        {"zqrp", "ZQR*P", true},
        {"zqr12", "zqr*p", false},
        {"12m", "*m", true},
        {"12mk", "*m", false},
        {"m", "*m", true},
        {"", "", true},
        {"a", "", false},
        {"", "*", true},
        {"anything", "**", true},
        {"abcabd", "*ab*d", true},
        {"aXbXbYc", "a*b*c", true},
        {"a*c", "a*c", true},
        {"abc", "ab", false},
    };
    for (const Case& c : cases) {
        EXPECT_EQ(HkStr::IMatch(c.text, c.pattern) != 0, c.isMatch) << c.text << " " << c.pattern;
    }
    EXPECT_EQ(HkStr::IMatch(std::string(20000, 'a').c_str(), "*a*a*a*a*b"), 0);  // no step is tried twice over
}

TEST(HkStr, ReadsLeadingNumbers) {
    struct Case {
        const char* text;
        std::int32_t value;
    };
    const Case cases[] = {
        {"", 0},
        {"0", 0},
        {"x1", 0},
        {"12ab", 12},
        {" \t\n+7", 7},
        {"-12", -12},
        {"--1", 0},
        {"007", 7},
        {"2147483647", 2147483647},
        {"2147483648", 2147483647},
        {"-2147483648", INT32_MIN},
        {"-99999999999999999999", INT32_MIN},
        {"99999999999999999999", 2147483647},
    };
    for (const Case& c : cases) {
        EXPECT_EQ(HkStr::AToL(c.text), c.value) << c.text;
        EXPECT_EQ(HkStr::AToI(c.text), c.value) << c.text;
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

TEST(HkStr, TakesLongTexts) {
    const std::string text(1 << 20, 'a');
    std::string shouted(text.size(), 'A');
    const std::unique_ptr<char[]> copy(HkStr::Dup(text.c_str()));
    EXPECT_EQ(HkStr::Len(copy.get()), text.size());
    EXPECT_EQ(HkStr::ICompare(copy.get(), shouted.c_str()), 0);
    shouted.back() = 'B';
    EXPECT_LT(HkStr::ICompare(copy.get(), shouted.c_str()), 0);
    EXPECT_NE(HkStr::IMatch(shouted.c_str(), "a*b"), 0);
    EXPECT_EQ(HkStr::AToL(std::string(1 << 20, '9').c_str()), INT32_MAX);
}

TEST(HkStr, FormatsAsPrintf) {
    char buffer[32];
    EXPECT_EQ(HkStr::SPrintf(buffer, "0%08x", 0xABCU), 9);
    EXPECT_STREQ(buffer, "000000abc");
    EXPECT_EQ(HkStr::SPrintf(buffer, "%c|%d", 'x', -5), 4);
    EXPECT_STREQ(buffer, "x|-5");
}

}  // namespace
