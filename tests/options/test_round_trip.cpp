// The arguments that an option table makes go through the parser of their command and come back as the same options.

#include <gtest/gtest.h>

#include <memory>
#include <random>
#include <string>
#include <vector>

#include "DataPath.h"
#include "examples/batch/OptionReader.h"

namespace {

struct Operation {
    const char* command;
    const char* needed;  ///< what the command asks for besides its options; null for nothing
    int first;
    int last;
};

const Operation deviceOperations[] = {{"program", "-p", 0, 67},
                                      {"erase", "-p", 67, 81},
                                      {"readback", "-p", 81, 83},
                                      {"verify", "-p", 84, 92},
                                      {"custcode", "-p", 94, 102}};
const Operation modeOperations[] = {
    {"generate", nullptr, 0, 3}, {"generate", nullptr, 4, 8}, {"generate", nullptr, 9, 18}};

std::vector<HkString> optionsOf(const DeviceOptionsMgr& manager, int first) {
    switch (first) {
        case 0:
            return manager.getProgramOptions();
        case 67:
            return manager.getEraseOptions();
        case 81:
            return manager.getReadbackOptions();
        case 84:
            return manager.getVerifyOptions();
        default:
            return manager.getCustCodeOptions();
    }
}

std::vector<HkString> optionsOf(const ModeOptionsMgr& manager, int first) {
    switch (first) {
        case 0:
            return manager.getCFGenerateOptions();
        case 4:
            return manager.getMPMGenerateOptions();
        default:
            return manager.getPFFGenerateOptions();
    }
}

/// The options as the command's parser, strict, gives them back.
std::unique_ptr<HkCmdArgs> parsed(const Operation& operation, const std::vector<HkString>& options) {
    CommandSet line;
    line.addCommand(operation.command);
    for (const HkString& option : options) {
        line.addCommand(option);
    }
    if (operation.needed != nullptr) {
        line.addCommand(operation.needed);
        line.addCommand(1);
    }
    return std::unique_ptr<HkCmdArgs>(TessalCmdargs::getCmdargs(line.getNumberCommands(), line.getCommands(), true));
}

std::string shown(const std::vector<HkString>& texts) {
    std::string result;
    for (const HkString& text : texts) {
        result += '[' + std::string(text) + ']';
    }
    return result;
}

template <class Manager, class Reader>
void expectRoundTrip(const Operation& operation, const OptionRow* rows, const Manager& manager) {
    const std::vector<HkString> options = optionsOf(manager, operation.first);
    SCOPED_TRACE(operation.command + shown(options));
    std::unique_ptr<HkCmdArgs> args;
    ASSERT_NO_THROW(args = parsed(operation, options));
    Manager back;
    Reader(*args, rows, back).read(operation.first, operation.last);
    EXPECT_EQ(shown(optionsOf(back, operation.first)), shown(options));
}

template <class Manager, class Option>
void give(Manager& manager, const OptionRow* rows, int row) {
    if (rows[row].isSwitch) {
        manager.setOption(static_cast<Option>(row), true);
    } else {
        const bool isFormat = std::string(rows[row].dashValue) == "-format";
        manager.setOption(static_cast<Option>(row), isFormat ? "hex" : "1");
    }
}

/// Gives a row of a choice. Arguments do not tell whose an empty one or a revision's bare switch is, so a revision's
/// switch and digit are given together.
template <class Manager, class Option>
void giveWhole(Manager& manager, const OptionRow* rows, int row) {
    const std::string dashValue = rows[row].dashValue;
    const bool isDigit = dashValue.size() == 1 && dashValue[0] <= '3';
    if (!isDigit) {
        give<Manager, Option>(manager, rows, row);
    }
    if (dashValue == "-ver") {
        give<Manager, Option>(manager, rows, row + 1);
    }
}

/// Every row alone, every row with the leader of its group, all rows, and random choices.
template <class Manager, class Option, class Reader>
void expectAllRoundTrips(const Operation& operation, const OptionRow* rows) {
    int leader = operation.first;
    for (int row = operation.first; row < operation.last; ++row) {
        leader = row <= leader + rows[leader].groupSize ? leader : row;
        Manager alone;
        give<Manager, Option>(alone, rows, row);
        expectRoundTrip<Manager, Reader>(operation, rows, alone);
        give<Manager, Option>(alone, rows, leader);
        expectRoundTrip<Manager, Reader>(operation, rows, alone);
    }
    std::mt19937 random(20261124);
    for (unsigned int share : {1U, 2U, 3U, 8U}) {
        for (int round = 0; round < 20; ++round) {
            Manager some;
            for (int row = operation.first; row < operation.last; ++row) {
                if (rows[row].dashValue[0] != '\0' && random() % share == 0) {
                    giveWhole<Manager, Option>(some, rows, row);
                }
            }
            expectRoundTrip<Manager, Reader>(operation, rows, some);
        }
    }
}

TEST(OptionRoundTrip, EveryRowComesBackThroughItsCommand) {
    DeviceProfile::setDataPath(SHIPPED_DATA_DIR);
    for (const Operation& operation : deviceOperations) {
        expectAllRoundTrips<DeviceOptionsMgr, tESSALNS::PROGRAM_OPTION, DeviceOptionReader>(operation, deviceRows);
    }
    for (const Operation& operation : modeOperations) {
        expectAllRoundTrips<ModeOptionsMgr, tESSALNS::MODE_OPTION, ModeOptionReader>(operation, modeRows);
    }
}

}  // namespace
