// The two option tables: their rows, ranges and clears.

#include <gtest/gtest.h>

#include <iterator>
#include <vector>

#include "DeviceOptionsMgr.h"
#include "ModeOptionsMgr.h"

namespace {

using namespace tESSALNS;

template <class Manager>
struct Range {
    std::vector<HkString> (Manager::*read)() const;
    void (Manager::*clear)();  ///< null where the operation has none
    int first;
    int last;
};

const Range<DeviceOptionsMgr> deviceRanges[] = {
    {&DeviceOptionsMgr::getProgramOptions, &DeviceOptionsMgr::clearProgramOptions, 0, 67},
    {&DeviceOptionsMgr::getEraseOptions, &DeviceOptionsMgr::clearEraseOptions, 67, 81},
    {&DeviceOptionsMgr::getReadbackOptions, &DeviceOptionsMgr::clearReadbackOptions, 81, 83},
    {&DeviceOptionsMgr::getVerifyOptions, nullptr, 84, 92},
    {&DeviceOptionsMgr::getCustCodeOptions, nullptr, 94, 102},
};
const Range<ModeOptionsMgr> modeRanges[] = {
    {&ModeOptionsMgr::getCFGenerateOptions, &ModeOptionsMgr::clearCFGenerateOptions, 0, 3},
    {&ModeOptionsMgr::getMPMGenerateOptions, &ModeOptionsMgr::clearMPMGenerateOptions, 4, 8},
    {&ModeOptionsMgr::getPFFGenerateOptions, &ModeOptionsMgr::clearPFFGenerateOptions, 9, 18},
};

/// Turns a row on, a switch by true and a text option by a text; the other way is refused.
template <class Manager, class Option>
void turnOn(Manager& manager, Option option) {
    EXPECT_NE(manager.setOption(option, true), manager.setOption(option, "T")) << int{option};
}

/// Resets by @p clear, after which exactly the rows of the range are off and what is no option stays.
template <class Option, class Manager>
void expectClears(void (Manager::*clear)(), int first, int last) {
    Manager manager;
    const int rows = manager.getNumberOptions();
    for (int row = 0; row < rows; ++row) {
        turnOn(manager, Option(row));
    }
    manager.setEnable(Option(1), false);
    manager.setOptionsModified(true);
    (manager.*clear)();
    for (int row = 0; row < rows; ++row) {
        const bool isOn = manager.getOption(row) || !manager.getOptionString(row).IsEmpty();
        EXPECT_EQ(isOn, row < first || row >= last) << row;
    }
    EXPECT_TRUE(!manager.isEnabled(Option(1)) && manager.getOptionsModified());
}

template <class Option, class Manager, std::size_t rangeCount, std::size_t rowCount>
void expectRanges(const Range<Manager> (&ranges)[rangeCount], const OptionRow (&rows)[rowCount]) {
    const int count = static_cast<int>(rowCount);
    for (const auto& [read, clear, first, last] : ranges) {
        SCOPED_TRACE(first);
        int membersLeft = 0;
        for (int row = 0; row < count; ++row) {
            const bool isMember = membersLeft > 0;
            membersLeft = isMember ? membersLeft - 1 : rows[row].groupSize;
            Manager manager;
            turnOn(manager, Option(row));
            EXPECT_EQ((manager.*read)().empty(), isMember || row < first || row >= last) << rows[row].key;
        }
        if (clear != nullptr) {
            expectClears<Option>(clear, first, last);
        }
    }
    expectClears<Option, Manager>(&Manager::clearAllOptions, 0, count);
}

TEST(OptionTables, ReadersAndClearsReachTheirRangeAlone) {
    expectRanges<PROGRAM_OPTION>(deviceRanges, programOptionRows);
    expectRanges<MODE_OPTION>(modeRanges, modeOptionRows);
}

TEST(OptionTables, RowNumbersAndLayoutArePartOfTheInterface) {
    const int numbers[] = {USERCODE,
                           CMGR_PROGRAM_MAX_OPTION,
                           REV0_CHECKED,
                           REV3_CUSTCODE,
                           PROGRAM_MAX_OPTIONS,
                           ERASE_MAX_OPTIONS,
                           VERIFY_REV0,
                           VERIFY_ALL,
                           CUSTCODE_REV0,
                           LOAD_REV};
    const int expected[] = {9, 24, 25, 56, 67, 81, 84, 92, 94, 104};
    EXPECT_TRUE(std::equal(std::begin(numbers), std::end(numbers), std::begin(expected)));
    constexpr std::size_t list = sizeof(std::vector<int>);
    static_assert(sizeof(PROGRAM_OPTION) == 4 && sizeof(MODE_OPTION) == 4);
    static_assert(sizeof(DeviceOptionsMgr) == sizeof(void*) + list + 8 + 2 * list + 8);
    static_assert(sizeof(ModeOptionsMgr) == sizeof(void*) + list + 2 * list + 8);
    DeviceOptionsMgr device;
    int switches = 0;
    for (int row = 0; row < device.getNumberOptions(); ++row) {
        switches += device.isOptionBool(row) ? 1 : 0;
    }
    EXPECT_EQ(switches, 92);
    EXPECT_STREQ(device.getNumberOfOptionsText(), "NumberOfDeviceOptions");
    EXPECT_STREQ(device.getAttribute(PROGRAM_MAX_OPTIONS), "PROGRAM_OPTIONS/PROGRAM_MAX_OPTIONS");
    ModeOptionsMgr mode;
    EXPECT_STREQ(mode.getNumberOfOptionsText(), "NumberOfModeOptions");
    EXPECT_STREQ(mode.getAttribute(IDCODE_LOOP_COUNT), "MODE_OPTIONS/IDCODE_LOOP_COUNT");
}

TEST(OptionTables, RowsOutsideAreRefused) {
    DeviceOptionsMgr manager;
    for (int number : {-1, 105, 1 << 30}) {
        const auto option = PROGRAM_OPTION(number);
        EXPECT_FALSE(manager.isEnabled(option) || manager.setEnable(option, true));
        EXPECT_FALSE(manager.setOption(option, true) || manager.setOption(option, "x"));
        EXPECT_TRUE(manager.getAttribute(option).IsEmpty());
    }
    EXPECT_TRUE(manager.setOption(USERCODE, static_cast<const char*>(nullptr)));
    manager.setUESSize(7);
    manager.init_attributes();
    EXPECT_TRUE(manager.getNumberOptions() == 210 && manager.getUESSize() == 0);
    EXPECT_FALSE(manager.setOption(PROGRAM_OPTION(105), true)) << "a description without a value row";
}

}  // namespace
