// Combined addresses: a start address under the values of two pins.

#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include <string>
#include <tuple>

#include "MessageRecorder.h"
#include "PromUtility.h"

namespace {

using testing::ElementsAre;

TEST(ComboAddress, PinsStandInTheTopTwoBits) {
    const std::tuple<const char*, unsigned int, int, unsigned int> cases[] = {
        {"10", 0x1000, 24, 0x801000}, {"01", 0x1000, 24, 0x401000},
        {"00", 0x1000, 24, 0x1000},   {"11", 0x400000, 24, 0x1000000},
        {"10", 0, 32, 0x80000000},    {nullptr, 0x20, 24, 0x20},
        {"", 0x20, 24, 0x20},         {"10", 0, 33, 1},
        {"10", 1, 0, 0x80000001},     {"yx", 0, 24, 0x800000},
        {"1", 0x1000, 24, 0x1000},    {"111", 0x1A, 24, 0x1A}};
    const MessageRecorder messages;
    for (const auto& [pins, start, bits, combo] : cases) {
        EXPECT_EQ(PromUtility::GetRSPinAndStartAddressCombo(pins, start, bits), combo) << bits << ' ' << start;
    }
    EXPECT_THAT(messages.info(), ElementsAre("Incorret length 1 of input RS pin, expected 2.\n",
                                             "Incorret length 3 of input RS pin, expected 2.\n"));
}

TEST(ComboAddress, TextsAreUpperCaseHexadecimal) {
    const std::tuple<const char*, const char*, int, const char*> cases[] = {{"00", "1a", 24, "1A"},
                                                                            {"11", "001000", 24, "C01000"},
                                                                            {"", "0", 24, "00000000"},
                                                                            {"10", "1000", 32, "80001000"},
                                                                            {nullptr, nullptr, 24, "00000000"}};
    for (const auto& [pins, start, bits, combo] : cases) {
        EXPECT_STREQ(PromUtility::GetRSPinAndStartAddressCombo(pins, start, bits), combo);
    }
}

TEST(ComboAddress, TakingApartIsTheWayBack) {
    HkString pins("00");
    unsigned int start = 0;
    PromUtility::DecomposeComboAddress(0xC01000U, pins, start, 24);
    EXPECT_STREQ(pins, "00");
    EXPECT_EQ(start, 0xC01000U) << "no pins in use";
    HkString startText;
    for (const char* given : {"10", "01", "11"}) {
        pins = "former";
        const HkString combo = PromUtility::GetRSPinAndStartAddressCombo(given, "2bcd1", 24);
        PromUtility::DecomposeComboAddress(combo, pins, startText, 24);
        EXPECT_STREQ(pins, given);
        EXPECT_STREQ(startText, "2BCD1");
    }
}

}  // namespace
