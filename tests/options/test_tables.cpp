// The two option tables: their rows, ranges and clears.

#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include <string>
#include <tuple>
#include <type_traits>
#include <vector>

#include "DeviceOptionsMgr.h"
#include "ModeOptionsMgr.h"

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

TEST(DeviceOptionsMgr, RowsAndTheirNumbersArePartOfTheInterface) {
    DeviceOptionsMgr manager;
    EXPECT_STREQ(manager.getNumberOfOptionsText(), "NumberOfDeviceOptions");
    EXPECT_STREQ(manager.getAttribute(PROGRAM_MAX_OPTIONS), "PROGRAM_OPTIONS/PROGRAM_MAX_OPTIONS");
    EXPECT_FALSE(manager.getOptionsModified());
    int switches = 0;
    for (int i = 0; i < manager.getNumberOptions(); ++i) {
        EXPECT_TRUE(manager.isEnabled(row<PROGRAM_OPTION>(i)) && !manager.getOption(i)) << i;
        switches += manager.isOptionBool(i) ? 1 : 0;
    }
    EXPECT_EQ(switches, 92);
    EXPECT_THAT((std::vector<int>{USERCODE, CMGR_PROGRAM_MAX_OPTION, REV0_CHECKED, REV3_CUSTCODE, PROGRAM_MAX_OPTIONS,
                                  ERASE_MAX_OPTIONS, VERIFY_REV0, VERIFY_ALL, CUSTCODE_REV0, CUSTCODE_ALL, LOAD_REV}),
                ElementsAre(9, 24, 25, 56, 67, 81, 84, 92, 94, 102, 104));
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
    const std::tuple<void (DeviceOptionsMgr::*)(), int, int> cases[] = {
        {&DeviceOptionsMgr::clearProgramOptions, 0, 67},
        {&DeviceOptionsMgr::clearEraseOptions, 67, 81},
        {&DeviceOptionsMgr::clearReadbackOptions, 81, 83},
        {&DeviceOptionsMgr::clearAllOptions, 0, 105}};
    for (const auto& [clear, first, last] : cases) {
        SCOPED_TRACE(first);
        DeviceOptionsMgr manager;
        setAll<DeviceOptionsMgr, PROGRAM_OPTION>(manager, 105);
        manager.setEnable(VERIFY, false);
        manager.setUESSize(7);
        manager.setOptionsModified(true);
        (manager.*clear)();
        for (int i = 0; i < 105; ++i) {
            const bool given = manager.getOption(i) || !manager.getOptionString(i).IsEmpty();
            EXPECT_EQ(given, i < first || i >= last) << i;
        }
        EXPECT_TRUE(!manager.isEnabled(VERIFY) && manager.getUESSize() == 7 && manager.getOptionsModified());
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
    EXPECT_TRUE(manager.setOption(USERCODE, static_cast<const char*>(nullptr)));
    manager.setOption(VERIFY, true);
    manager.init_attributes();
    EXPECT_EQ(manager.getNumberOptions(), 210);
    manager.commit_options();
    EXPECT_THAT(plain(manager.getProgramOptions()), ElementsAre("-v"));
    EXPECT_FALSE(manager.setOption(row<PROGRAM_OPTION>(105), true)) << "a description without a value row";
}

TEST(ModeOptionsMgr, HasThreeRangesAndALoopCount) {
    ModeOptionsMgr manager;
    EXPECT_STREQ(manager.getNumberOfOptionsText(), "NumberOfModeOptions");
    EXPECT_STREQ(manager.getAttribute(row<MODE_OPTION>(19)), "MODE_OPTIONS/IDCODE_LOOP_COUNT");
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
    EXPECT_FALSE(manager.isEnabled(row<MODE_OPTION>(-1)) || manager.setEnable(row<MODE_OPTION>(20), true));
}

}  // namespace
