// The shipped tables. The two of options: the rows that each operation reads and resets, and its arguments, which go
// through the parser of their command and come back as the same options. That of preferences: the names of its rows.

#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include <algorithm>
#include <memory>
#include <random>
#include <string>
#include <vector>

#include "DataPath.h"
#include "Preference.h"
#include "examples/batch/OptionReader.h"

namespace {

using namespace tESSALNS;

template <class Manager>
struct Operation {
    const char* command;
    int first;
    int last;
    std::vector<HkString> (Manager::*options)() const;
    void (Manager::*clear)();  ///< null where the operation has none
};

const std::vector<Operation<DeviceOptionsMgr>> deviceOperations = {
    {"program", 0, 67, &DeviceOptionsMgr::getProgramOptions, &DeviceOptionsMgr::clearProgramOptions},
    {"erase", 67, 81, &DeviceOptionsMgr::getEraseOptions, &DeviceOptionsMgr::clearEraseOptions},
    {"readback", 81, 83, &DeviceOptionsMgr::getReadbackOptions, &DeviceOptionsMgr::clearReadbackOptions},
    {"verify", 84, 92, &DeviceOptionsMgr::getVerifyOptions, nullptr},
    {"custcode", 94, 102, &DeviceOptionsMgr::getCustCodeOptions, nullptr}};
const std::vector<Operation<ModeOptionsMgr>> modeOperations = {
    {"generate", 0, 3, &ModeOptionsMgr::getCFGenerateOptions, &ModeOptionsMgr::clearCFGenerateOptions},
    {"generate", 4, 8, &ModeOptionsMgr::getMPMGenerateOptions, &ModeOptionsMgr::clearMPMGenerateOptions},
    {"generate", 9, 18, &ModeOptionsMgr::getPFFGenerateOptions, &ModeOptionsMgr::clearPFFGenerateOptions}};

/// The checks of one operation on the rows of its table.
template <class Manager, class Option>
class Table {
public:
    Table(const Operation<Manager>& operation, const OptionRow* rows) : m_operation(operation), m_rows(rows) {}

    /// Every row, which alone shows only inside the range and when it is no member of a group, with the leader of its
    /// group, and random choices, from all rows to few.
    void expectRoundTrips() {
        int leader = 0;
        for (int row = 0; row < m_count; ++row) {
            leader = row <= leader + m_rows[leader].groupSize ? leader : row;
            Manager manager;
            give(manager, row);
            EXPECT_EQ((manager.*m_operation.options)().empty(), row != leader || !isInside(row)) << m_rows[row].key;
            give(manager, leader);
            expectRoundTrip(manager);
        }
        for (unsigned int round = 0; round < 40; ++round) {
            expectRoundTrip(randomChoice(1 + round % 8));
        }
    }

    /// Exactly the rows of the range are reset, and what is no option stays.
    void expectClear() {
        Manager manager;
        for (int row = 0; row < m_count; ++row) {
            give(manager, row);
        }
        manager.setEnable(Option(1), false);
        manager.setOptionsModified(true);
        (manager.*m_operation.clear)();
        for (int row = 0; row < m_count; ++row) {
            const bool isOn = manager.getOption(row) || !manager.getOptionString(row).IsEmpty();
            EXPECT_NE(isOn, isInside(row)) << m_rows[row].key;
        }
        EXPECT_TRUE(!manager.isEnabled(Option(1)) && manager.getOptionsModified());
    }

private:
    bool isInside(int row) const { return row >= m_operation.first && row < m_operation.last; }

    void expectRoundTrip(const Manager& manager) const {
        const std::vector<HkString> options = (manager.*m_operation.options)();
        SCOPED_TRACE(m_operation.command + testing::PrintToString(options));
        std::unique_ptr<HkCmdArgs> args;
        ASSERT_NO_THROW(args = parsed(options));
        Manager back;
        OptionReader<Manager, Option>(*args, m_rows, back).read(m_operation.first, m_operation.last);
        EXPECT_EQ((back.*m_operation.options)(), options);
    }

    /// The options as the command's parser, strict, gives them back.
    std::unique_ptr<HkCmdArgs> parsed(const std::vector<HkString>& options) const {
        CommandSet line;
        line.addCommand(m_operation.command);
        for (const HkString& option : options) {
            line.addCommand(option);
        }
        if constexpr (std::is_same_v<Manager, DeviceOptionsMgr>) {
            line.addCommand("-p");
            line.addCommand(1);
        }
        return std::unique_ptr<HkCmdArgs>(
            TessalCmdargs::getCmdargs(line.getNumberCommands(), line.getCommands(), true));
    }

    /// Turns a row on, a switch by true and a text option by a text; the other way is refused.
    void give(Manager& manager, int row) const {
        const bool isFormat = std::string(m_rows[row].dashValue) == "-format";
        EXPECT_EQ(manager.setOption(Option(row), true), m_rows[row].isSwitch()) << m_rows[row].key;
        EXPECT_NE(manager.setOption(Option(row), isFormat ? "hex" : "1"), m_rows[row].isSwitch()) << m_rows[row].key;
    }

    /// Arguments do not tell whose an empty one or a revision's bare switch is, so a revision's switch and digit are
    /// given together.
    Manager randomChoice(unsigned int share) {
        Manager some;
        for (int row = m_operation.first; row < m_operation.last; ++row) {
            const std::string dashValue = m_rows[row].dashValue;
            const bool isDigit = dashValue.size() == 1 && dashValue[0] <= '3';
            if (!dashValue.empty() && !isDigit && m_random() % share == 0) {
                give(some, row);
                give(some, dashValue == "-ver" ? row + 1 : row);
            }
        }
        return some;
    }

    const Operation<Manager>& m_operation;
    const OptionRow* m_rows;
    const int m_count = Manager().getNumberOptions();
    std::mt19937 m_random{20261124};
};

template <class Option, class Manager>
void expectTable(const std::vector<Operation<Manager>>& operations, const OptionRow* rows) {
    for (const Operation<Manager>& operation : operations) {
        SCOPED_TRACE(operation.first);
        Table<Manager, Option> table(operation, rows);
        table.expectRoundTrips();
        operation.clear != nullptr ? table.expectClear() : void();
    }
    const Operation<Manager> all{"", 0, Manager().getNumberOptions(), nullptr, &Manager::clearAllOptions};
    Table<Manager, Option>(all, rows).expectClear();
}

TEST(OptionTables, EveryRowComesBackThroughItsCommandAndIsReset) {
    DeviceProfile::setDataPath(SHIPPED_DATA_DIR);
    expectTable<PROGRAM_OPTION>(deviceOperations, programOptionRows);
    expectTable<MODE_OPTION>(modeOperations, modeOptionRows);
}

TEST(OptionTables, RowNumbersKeysAndLayoutArePartOfTheInterface) {
    static_assert(USERCODE == 9 && REV0_CHECKED == 25 && REV3_CUSTCODE == 56 && VERIFY_ALL == 92 && LOAD_REV == 104);
    constexpr std::size_t list = sizeof(std::vector<int>);
    static_assert(sizeof(PROGRAM_OPTION) == 4 && sizeof(MODE_OPTION) == 4);
    static_assert(sizeof(DeviceOptionsMgr) == sizeof(void*) + list + 8 + 2 * list + 8);
    static_assert(sizeof(ModeOptionsMgr) == sizeof(void*) + list + 2 * list + 8);
    EXPECT_STREQ(DeviceOptionsMgr().getAttribute(PROGRAM_MAX_OPTIONS), "PROGRAM_OPTIONS/PROGRAM_MAX_OPTIONS");
    EXPECT_STREQ(ModeOptionsMgr().getAttribute(IDCODE_LOOP_COUNT), "MODE_OPTIONS/IDCODE_LOOP_COUNT");
}

TEST(OptionTables, RowsOutsideAreRefused) {
    DeviceOptionsMgr manager;
    for (int number : {-1, 105, 1 << 30}) {
        const auto option = PROGRAM_OPTION(number);
        EXPECT_FALSE(manager.isEnabled(option) || manager.setEnable(option, true) || manager.setOption(option, true));
        EXPECT_TRUE(manager.getAttribute(option).IsEmpty());
    }
    EXPECT_TRUE(manager.setOption(USERCODE, static_cast<const char*>(nullptr)));
    manager.init_attributes();
    EXPECT_FALSE(manager.setOption(PROGRAM_OPTION(105), true)) << "a description without a value row";
}

#define TESSAL_NAME(name) #name,
constexpr const char* enumerators[] = {TESSAL_PREFERENCES(TESSAL_NAME)};
#undef TESSAL_NAME

TEST(ShippedPreferences, EveryEnumeratorIsTheRowOfItsName) {
    DeviceProfile::setDataPath(SHIPPED_DATA_DIR);
    TessalPreference& preferences = *TessalPreference::getPreferenceObject();
    int row = 0;
    for (std::string name : enumerators) {
        name.erase(std::remove(name.begin(), name.end(), '_'), name.end());
        const auto preference = TessalPreference::PREFERENCE(row++);
        EXPECT_THAT(TessalPreference::pref2String(preference), testing::StrCaseEq(name));
        EXPECT_STRNE(preferences.getPreference(preference), "") << name;
    }
    EXPECT_STREQ(preferences.getPreference(TessalPreference::PREFERENCE(row)), "") << "one row too many";
}

}  // namespace
