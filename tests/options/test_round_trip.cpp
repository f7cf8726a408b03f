// The arguments that an option table makes go through the parser of their command and come back as the same options.

#include <gtest/gtest.h>

#include <memory>
#include <random>
#include <string>
#include <vector>

#include "DataPath.h"
#include "examples/batch/OptionReader.h"

namespace {

template <class Manager>
struct Operation {
    const char* command;
    int first;
    int last;
    std::vector<HkString> (Manager::*options)() const;
};

const std::vector<Operation<DeviceOptionsMgr>> deviceOperations = {
    {"program", 0, 67, &DeviceOptionsMgr::getProgramOptions},
    {"erase", 67, 81, &DeviceOptionsMgr::getEraseOptions},
    {"readback", 81, 83, &DeviceOptionsMgr::getReadbackOptions},
    {"verify", 84, 92, &DeviceOptionsMgr::getVerifyOptions},
    {"custcode", 94, 102, &DeviceOptionsMgr::getCustCodeOptions}};
const std::vector<Operation<ModeOptionsMgr>> modeOperations = {
    {"generate", 0, 3, &ModeOptionsMgr::getCFGenerateOptions},
    {"generate", 4, 8, &ModeOptionsMgr::getMPMGenerateOptions},
    {"generate", 9, 18, &ModeOptionsMgr::getPFFGenerateOptions}};

std::string shown(const std::vector<HkString>& texts) {
    std::string result;
    for (const HkString& text : texts) {
        result += '[' + std::string(text) + ']';
    }
    return result;
}

/// The round trips of the options of one operation.
template <class Manager, class Option>
class RoundTrips {
public:
    RoundTrips(const Operation<Manager>& operation, const tESSALNS::OptionRow* rows, bool asksForPosition)
        : m_operation(operation), m_rows(rows), m_asksForPosition(asksForPosition) {}

    /// Every row alone, every row with the leader of its group, and random choices, from all rows to few.
    void expectAll() {
        int leader = m_operation.first;
        for (int row = m_operation.first; row < m_operation.last; ++row) {
            leader = row <= leader + m_rows[leader].groupSize ? leader : row;
            Manager alone;
            give(alone, row);
            expect(alone);
            give(alone, leader);
            expect(alone);
        }
        for (unsigned int round = 0; round < 40; ++round) {
            expect(randomChoice(1 + round % 8));
        }
    }

private:
    void expect(const Manager& manager) const {
        const std::vector<HkString> options = (manager.*m_operation.options)();
        SCOPED_TRACE(m_operation.command + shown(options));
        std::unique_ptr<HkCmdArgs> args;
        ASSERT_NO_THROW(args = parsed(options));
        Manager back;
        OptionReader<Manager, Option>(*args, m_rows, back).read(m_operation.first, m_operation.last);
        EXPECT_EQ(shown((back.*m_operation.options)()), shown(options));
    }

    /// The options as the command's parser, strict, gives them back.
    std::unique_ptr<HkCmdArgs> parsed(const std::vector<HkString>& options) const {
        CommandSet line;
        line.addCommand(m_operation.command);
        for (const HkString& option : options) {
            line.addCommand(option);
        }
        if (m_asksForPosition) {
            line.addCommand("-p");
            line.addCommand(1);
        }
        return std::unique_ptr<HkCmdArgs>(
            TessalCmdargs::getCmdargs(line.getNumberCommands(), line.getCommands(), true));
    }

    void give(Manager& manager, int row) const {
        const auto option = static_cast<Option>(row);
        m_rows[row].isSwitch()
            ? manager.setOption(option, true)
            : manager.setOption(option, std::string(m_rows[row].dashValue) == "-format" ? "hex" : "1");
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
    const tESSALNS::OptionRow* m_rows;
    bool m_asksForPosition;
    std::mt19937 m_random{20261124};
};

TEST(OptionRoundTrip, EveryRowComesBackThroughItsCommand) {
    DeviceProfile::setDataPath(SHIPPED_DATA_DIR);
    for (const auto& operation : deviceOperations) {
        RoundTrips<DeviceOptionsMgr, tESSALNS::PROGRAM_OPTION>(operation, tESSALNS::programOptionRows, true)
            .expectAll();
    }
    for (const auto& operation : modeOperations) {
        RoundTrips<ModeOptionsMgr, tESSALNS::MODE_OPTION>(operation, tESSALNS::modeOptionRows, false).expectAll();
    }
}

}  // namespace
