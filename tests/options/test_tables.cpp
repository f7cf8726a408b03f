// The two option tables: their rows, ranges and clears.

#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include <cstdlib>
#include <new>
#include <string>
#include <type_traits>
#include <vector>

#include "DeviceOptionsMgr.h"
#include "ModeOptionsMgr.h"

namespace {

std::size_t allocations = 0;

}  // namespace

// Not inlined: the compiler would see malloc's memory go to delete and warn.
[[gnu::noinline]] void* operator new(std::size_t size) {
    ++allocations;
    if (void* const memory = std::malloc(size)) {
        return memory;
    }
    throw std::bad_alloc();
}

[[gnu::noinline]] void operator delete(void* memory) noexcept {
    std::free(memory);
}

[[gnu::noinline]] void operator delete(void* memory, std::size_t) noexcept {
    std::free(memory);
}

namespace {

using namespace tESSALNS;
using testing::ElementsAre;
using testing::IsEmpty;

std::vector<std::string> plain(const std::vector<HkString>& texts) {
    return {texts.begin(), texts.end()};
}

template <class Option>
Option row(int number) {
    return static_cast<Option>(number);
}

/// Turns every row on, switches by true and text options by a text.
template <class Manager, class Option>
void setAll(Manager& manager, int count) {
    for (int i = 0; i < count; ++i) {
        EXPECT_NE(manager.setOption(row<Option>(i), true), manager.setOption(row<Option>(i), "T"));
    }
}

TEST(DeviceOptionsMgr, HasItsRowsUnset) {
    DeviceOptionsMgr manager;
    EXPECT_EQ(manager.getNumberOptions(), 105);
    EXPECT_STREQ(manager.getNumberOfOptionsText(), "NumberOfDeviceOptions");
    EXPECT_EQ(manager.getUESSize(), 0);
    EXPECT_FALSE(manager.getOptionsModified());
    int switches = 0;
    for (int i = 0; i < 105; ++i) {
        EXPECT_TRUE(manager.isEnabled(row<PROGRAM_OPTION>(i)));
        EXPECT_FALSE(manager.getOption(i));
        switches += manager.isOptionBool(i) ? 1 : 0;
    }
    EXPECT_EQ(switches, 92);
    EXPECT_STREQ(manager.getAttribute(PROGRAM_MAX_OPTIONS), "PROGRAM_OPTIONS/PROGRAM_MAX_OPTIONS");
}

TEST(DeviceOptionsMgr, RowNumbersArePartOfTheInterface) {
    const std::vector<std::pair<PROGRAM_OPTION, int>> rows = {{ERASE_B4_PROGRAMMING, 0},
                                                              {USERCODE, 9},
                                                              {CMGR_PROGRAM_MAX_OPTION, 24},
                                                              {REV0_CHECKED, 25},
                                                              {REV3_CUSTCODE, 56},
                                                              {PROGRAM_MAX_OPTIONS, 67},
                                                              {ERASE_MAX_OPTIONS, 81},
                                                              {READBACK_FILE, 82},
                                                              {VERIFY_REV0, 84},
                                                              {VERIFY_ALL, 92},
                                                              {CUSTCODE_REV0, 94},
                                                              {CUSTCODE_ALL, 102},
                                                              {LOAD_REV, 104}};
    for (const auto& [option, number] : rows) {
        EXPECT_EQ(static_cast<int>(option), number);
    }
    static_assert(std::is_same_v<std::underlying_type_t<PROGRAM_OPTION>, std::int32_t>);
}

TEST(DeviceOptionsMgr, ReadersGiveTheirRangeInRowOrder) {
    DeviceOptionsMgr manager;
    manager.setOption(USERCODE, "1234");
    manager.setOption(VERIFY, true);
    manager.setOption(ERASE_B4_PROGRAMMING, true);
    for (PROGRAM_OPTION option : {REV1_CHECKED, REV1_VALUE, REV1_RP, REV1_FRC, REV2_WP}) {
        manager.setOption(option, true);
    }
    manager.setOption(REV1_CUSTCODE, HkString("1A2B"));
    manager.setOption(CLOCK_FREQUENCY, true);
    manager.setOption(FREQ_20MHZ, true);
    EXPECT_THAT(plain(manager.getProgramOptions()),
                ElementsAre("-e", "-v", "-u", "1234", "-ver", "1 rp frc customercode:1A2B", "-clkFreq", "20"));
    EXPECT_THAT(manager.getEraseOptions(), IsEmpty());
    manager.setOption(PROGRAM_MAX_OPTIONS, true);
    manager.setOption(ERASE_REV2, true);
    manager.setOption(ERASE_REV2_VALUE, true);
    EXPECT_THAT(plain(manager.getEraseOptions()), ElementsAre("", "-ver", "2"));
}

TEST(DeviceOptionsMgr, FullRangesHoldTheRowsThatBelongToThem) {
    DeviceOptionsMgr manager;
    setAll<DeviceOptionsMgr, PROGRAM_OPTION>(manager, 105);
    EXPECT_EQ(manager.getProgramOptions().size(), 67U - 4 * 6 + 7);
    EXPECT_THAT(plain(manager.getEraseOptions()), ElementsAre("", "", "-o", "-ver", "0", "-ver", "1", "-ver", "2",
                                                              "-ver", "3", "", "-turbo", "-revisionSelection"));
    EXPECT_THAT(plain(manager.getReadbackOptions()), ElementsAre("", "-file", "T"));
    for (const auto& reader : {&DeviceOptionsMgr::getVerifyOptions, &DeviceOptionsMgr::getCustCodeOptions}) {
        EXPECT_THAT(plain((manager.*reader)()), ElementsAre("-ver", "0", "-ver", "1", "-ver", "2", "-ver", "3"));
    }
}

TEST(DeviceOptionsMgr, ClearsResetTheirRangeAlone) {
    struct Case {
        const char* name;
        void (DeviceOptionsMgr::*clear)();
        int first;
        int last;
    };
    const Case cases[] = {{"program", &DeviceOptionsMgr::clearProgramOptions, 0, 67},
                          {"erase", &DeviceOptionsMgr::clearEraseOptions, 67, 81},
                          {"readback", &DeviceOptionsMgr::clearReadbackOptions, 81, 83},
                          {"all", &DeviceOptionsMgr::clearAllOptions, 0, 105}};
    for (const Case& c : cases) {
        SCOPED_TRACE(c.name);
        DeviceOptionsMgr manager;
        setAll<DeviceOptionsMgr, PROGRAM_OPTION>(manager, 105);
        manager.setEnable(VERIFY, false);
        manager.setUESSize(7);
        manager.setOptionsModified(true);
        (manager.*c.clear)();
        for (int i = 0; i < 105; ++i) {
            const bool given = manager.getOption(i) || !manager.getOptionString(i).IsEmpty();
            EXPECT_EQ(given, i < c.first || i >= c.last) << i;
        }
        EXPECT_FALSE(manager.isEnabled(VERIFY));
        EXPECT_EQ(manager.getUESSize(), 7);
        EXPECT_TRUE(DeviceOptionsMgr(manager).getOptionsModified());
    }
}

TEST(DeviceOptionsMgr, WrongRowsAndKindsAreRefused) {
    DeviceOptionsMgr manager;
    for (int number : {-1, 105, 1 << 30}) {
        const auto option = row<PROGRAM_OPTION>(number);
        EXPECT_FALSE(manager.isEnabled(option));
        EXPECT_FALSE(manager.setEnable(option, true));
        EXPECT_FALSE(manager.setOption(option, true));
        EXPECT_FALSE(manager.setOption(option, "x"));
        EXPECT_TRUE(manager.getAttribute(option).IsEmpty());
    }
    EXPECT_FALSE(manager.setOption(USERCODE, true));
    EXPECT_FALSE(manager.setOption(VERIFY, "x"));
    EXPECT_TRUE(manager.setOption(USERCODE, static_cast<const char*>(nullptr)));
    EXPECT_THAT(manager.getProgramOptions(), IsEmpty());
}

TEST(DeviceOptionsMgr, FurtherDescriptionsLeaveTheRowsAlone) {
    DeviceOptionsMgr manager;
    manager.setUESSize(3);
    manager.setOption(VERIFY, true);
    manager.init_attributes();
    EXPECT_EQ(manager.getNumberOptions(), 210);
    EXPECT_EQ(manager.getUESSize(), 0);
    manager.commit_options();
    EXPECT_THAT(plain(manager.getProgramOptions()), ElementsAre("-v"));
    EXPECT_FALSE(manager.setOption(row<PROGRAM_OPTION>(105), true)) << "a description without a value row";
}

TEST(DeviceOptionsMgr, SettersAllocateNothingButTheText) {
    DeviceOptionsMgr manager;
    const HkString text("a text that is longer than any small buffer could hold without an allocation");
    allocations = 0;
    for (int i = 0; i < 105; ++i) {
        manager.setOption(row<PROGRAM_OPTION>(i), true);
        manager.setOption(row<PROGRAM_OPTION>(i), text);
    }
    EXPECT_EQ(allocations, 0U) << "switches, and texts that are shared";
    manager.setOption(USERCODE, text.c_str());
    EXPECT_EQ(allocations, 1U);
    allocations = 0;
    EXPECT_THAT(manager.getVerifyOptions().size(), 8U);
    EXPECT_LT(allocations, 50U) << "the result grows; the 105 descriptions are not copied";
}

TEST(ModeOptionsMgr, HasThreeRangesAndALoopCount) {
    ModeOptionsMgr manager;
    EXPECT_EQ(manager.getNumberOptions(), 20);
    EXPECT_STREQ(manager.getNumberOfOptionsText(), "NumberOfModeOptions");
    EXPECT_STREQ(manager.getAttribute(IDCODE_LOOP_COUNT), "MODE_OPTIONS/IDCODE_LOOP_COUNT");
    EXPECT_EQ(static_cast<int>(IDCODE_LOOP_COUNT), 19);
    setAll<ModeOptionsMgr, MODE_OPTION>(manager, 20);
    EXPECT_THAT(plain(manager.getCFGenerateOptions()), ElementsAre("", "-active", "T", "-path", "T"));
    EXPECT_THAT(plain(manager.getMPMGenerateOptions()), ElementsAre("", "-path", "T", "-output", "T", "-compressed"));
    EXPECT_THAT(plain(manager.getPFFGenerateOptions()),
                ElementsAre("", "-path", "T", "-output", "T", "-compressed", "-format", "T", "-fillValue", "T",
                            "-disableswap", "-generic", "-multiboot"));
    manager.clearMPMGenerateOptions();
    EXPECT_THAT(manager.getMPMGenerateOptions(), IsEmpty());
    EXPECT_EQ(manager.getCFGenerateOptions().size(), 5U);
    manager.clearCFGenerateOptions();
    manager.clearPFFGenerateOptions();
    EXPECT_THAT(manager.getPFFGenerateOptions(), IsEmpty());
    EXPECT_STREQ(manager.getOptionString(IDCODE_LOOP_COUNT), "T");
    manager.clearAllOptions();
    EXPECT_STREQ(manager.getOptionString(IDCODE_LOOP_COUNT), "");
    for (int number : {-1, 20}) {
        EXPECT_FALSE(manager.isEnabled(row<MODE_OPTION>(number)));
        EXPECT_FALSE(manager.setEnable(row<MODE_OPTION>(number), true));
    }
}

}  // namespace
