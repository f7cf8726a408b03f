// Combined addresses: a start address under the values of two pins.

#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include <tuple>

#include "MessageRecorder.h"
#include "PromUtility.h"

namespace {

using testing::ElementsAre;

TEST(ComboAddress, PinsStandInTheTopTwoBits) {
    const std::tuple<const char*, unsigned int, int, unsigned int> cases[] = {
        {"00", 0x1000, 24, 0x1000},      {"01", 0x1000, 24, 0x401000}, {"10", 0x1000, 24, 0x801000},
        {"11", 0x400000, 24, 0x1000000}, {"10", 0, 32, 0x80000000},    {"10", 0, 33, 1},
        {"10", 1, 0, 0x80000001},        {nullptr, 0x20, 24, 0x20},    {"", 0x20, 24, 0x20},
        {"1", 0x1000, 24, 0x1000},       {"111", 0x1A, 24, 0x1A}};
    const MessageRecorder messages;
    for (const auto& [pins, start, bits, combo] : cases) {
        EXPECT_EQ(PromUtility::GetRSPinAndStartAddressCombo(pins, start, bits), combo) << bits << ' ' << start;
    }
    EXPECT_THAT(messages.info(), ElementsAre("Incorret length 1 of input RS pin, expected 2.\n",
                                             "Incorret length 3 of input RS pin, expected 2.\n"));
}

TEST(ComboAddress, TakingApartIsTheWayBackInUpperCaseHexadecimal) {
    const std::tuple<const char*, const char*, const char*, const char*> cases[] = {
        {"01", "2bcd1", "42BCD1", "2BCD1"}, {"11", "001000", "C01000", "1000"}, {"10", nullptr, "800000", "00000000"}};
    HkString start;
    for (const auto& [pins, given, combo, upperStart] : cases) {
        EXPECT_STREQ(PromUtility::GetRSPinAndStartAddressCombo(pins, given, 24), combo);
        HkString foundPins("former");
        PromUtility::DecomposeComboAddress(combo, foundPins, start, 24);
        EXPECT_STREQ(foundPins, pins);
        EXPECT_STREQ(start, upperStart);
    }
    EXPECT_STREQ(PromUtility::GetRSPinAndStartAddressCombo("10", "1000", 32), "80001000");
    HkString unused("00");
    PromUtility::DecomposeComboAddress("C01000", unused, start, 24);
    EXPECT_STREQ(unused, "00");
    EXPECT_STREQ(start, "C01000") << "no pins in use";
}

}  // namespace
