// Combined addresses: a start address under the values of two pins.

#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include <string>

#include "MessageRecorder.h"
#include "PromUtility.h"

namespace {

using testing::ElementsAre;
using testing::IsEmpty;

TEST(ComboAddress, PinsStandInTheTopTwoBits) {
    struct Case {
        const char* pins;
        unsigned int start;
        int bits;
        unsigned int combo;
    };
    const Case cases[] = {{"10", 0x1000, 24, 0x801000},
                          {"01", 0x1000, 24, 0x401000},
                          {"11", 0x1000, 24, 0xC01000},
                          {"00", 0x1000, 24, 0x1000},
                          {"11", 0x400000, 24, 0x1000000},
                          {"10", 0, 32, 0x80000000},
                          {nullptr, 0x20, 24, 0x20},
                          {"", 0x20, 24, 0x20},
                          {"10", 0, 33, 1},
                          {"10", 1, 0, 0x80000001},
                          {"yx", 0, 24, 0x800000}};
    const MessageRecorder messages;
    for (const Case& c : cases) {
        SCOPED_TRACE(testing::Message() << (c.pins != nullptr ? c.pins : "null") << ' ' << c.bits);
        EXPECT_EQ(PromUtility::GetRSPinAndStartAddressCombo(c.pins, c.start, c.bits), c.combo);
    }
    EXPECT_THAT(messages.all(), IsEmpty());
}

TEST(ComboAddress, PinsOfAnotherLengthAreReportedAndLeftOut) {
    const MessageRecorder messages;
    EXPECT_EQ(PromUtility::GetRSPinAndStartAddressCombo("1", 0x1000U, 24), 0x1000U);
    EXPECT_STREQ(PromUtility::GetRSPinAndStartAddressCombo("111", "1a", 24), "1A");
    EXPECT_THAT(messages.info(), ElementsAre("Incorret length 1 of input RS pin, expected 2.\n",
                                             "Incorret length 3 of input RS pin, expected 2.\n"));
}

TEST(ComboAddress, TextsAreUpperCaseHexadecimal) {
    EXPECT_STREQ(PromUtility::GetRSPinAndStartAddressCombo("00", "1a", 24), "1A");
    EXPECT_STREQ(PromUtility::GetRSPinAndStartAddressCombo("11", "001000", 24), "C01000");
    EXPECT_STREQ(PromUtility::GetRSPinAndStartAddressCombo("", "0", 24), "00000000");
    EXPECT_STREQ(PromUtility::GetRSPinAndStartAddressCombo("10", "1000", 32), "80001000");
    EXPECT_STREQ(PromUtility::GetRSPinAndStartAddressCombo(nullptr, nullptr, 24), "00000000");
}

TEST(ComboAddress, TakingApartIsTheWayBack) {
    HkString pins;
    unsigned int start = 0;
    PromUtility::DecomposeComboAddress(0xC01000U, pins, start, 24);
    EXPECT_STREQ(pins, "11");
    EXPECT_EQ(start, 0x1000U);
    pins = "00";
    PromUtility::DecomposeComboAddress(0xC01000U, pins, start, 24);
    EXPECT_STREQ(pins, "00");
    EXPECT_EQ(start, 0xC01000U) << "no pins in use";
    HkString startText;
    for (const char* given : {"10", "01", "11"}) {
        pins = "former";
        PromUtility::DecomposeComboAddress(PromUtility::GetRSPinAndStartAddressCombo(given, "2bcd1", 24), pins,
                                           startText, 24);
        EXPECT_STREQ(pins, given);
        EXPECT_STREQ(startText, "2BCD1");
    }
}

}  // namespace
