#include "TessalCmdargs.h"

#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include <memory>
#include <string>
#include <vector>

#include "CommandSet.h"
#include "DataPath.h"
#include "MessageRecorder.h"
#include "TemporaryDirectory.h"
#include "TessalException.h"

namespace {

using testing::ElementsAre;

/// Data files with these rows of commands, looked at as long as it lives.
struct CommandData : TemporaryDirectory {
    explicit CommandData(const std::string& rows) {
        write("tessal.acd", "[base]\n" + rows + "\n");
        DeviceProfile::setDataPath(path().c_str());
    }
    ~CommandData() { DeviceProfile::setDataPath(nullptr); }
};

std::unique_ptr<HkCmdArgs> parse(const char* line, bool strict) {
    const std::unique_ptr<CommandSet> commands(CommandSet::string2CommandSet(line));
    return std::unique_ptr<HkCmdArgs>(
        TessalCmdargs::getCmdargs(commands->getNumberCommands(), commands->getCommands(), strict));
}

std::vector<std::string> matching(const char* prefix) {
    const auto names = TessalCmdargs::findMatchingCommands(prefix);
    return {names.begin(), names.end()};
}

// The table lives as long as the process and only grows, so this case comes first.
TEST(TessalCmdargs, IsLoadedByTheFirstCommandAndByNothingElse) {
    const CommandData data("OTHER = x");
    const MessageRecorder messages;
    EXPECT_THROW(parse("b", true), ACDEntryNotFoundException) << "no key yet";
    const CommandData later("COMMAND_FORMAT = b,TRUE,[-x]");
    EXPECT_TRUE(TessalCmdargs::findAllCommands().empty());
    EXPECT_STREQ(TessalCmdargs::findFormatString("b"), "");
    EXPECT_TRUE(parse("b -x", true)->isGiven("-x"));
    EXPECT_STREQ(TessalCmdargs::findFormatString("b"), "[-x]");
    EXPECT_TRUE(messages.all().empty());
}

TEST(TessalCmdargs, ListsBatchCommandsByTheirBytes) {
    const CommandData data("COMMAND_FORMAT = lb,TRUE,[-x]:la,true,[-y]:lB,TRUE,[-z]:lc,FALSE,[-w]:lb,TRUE,[-new]");
    TessalCmdargs::createCommandMap();
    EXPECT_THAT(matching("l"), ElementsAre("lB", "la", "lb"));
    EXPECT_THAT(matching("LA"), ElementsAre("la"));
    EXPECT_THAT(matching("lbx"), ElementsAre());
    EXPECT_EQ(matching(nullptr), matching(""));
    EXPECT_EQ(TessalCmdargs::findAllCommands().size(), matching("").size());
    EXPECT_STREQ(TessalCmdargs::findBatchFormatString("lb"), "[-new]") << "the last row of a name holds";
    EXPECT_STREQ(TessalCmdargs::findFormatString("LA"), "") << "looked up exactly";
    EXPECT_STREQ(TessalCmdargs::findFormatString("lc"), "[-w]");
    EXPECT_STREQ(TessalCmdargs::findBatchFormatString("lc"), "");
    EXPECT_STREQ(TessalCmdargs::findFormatString(nullptr), "");
    EXPECT_TRUE(parse("LC -w", true)->isGiven("-w")) << "the parser takes commands of every kind";
}

TEST(TessalCmdargs, RefusesWhatDoesNotFit) {
    const CommandData data("COMMAND_FORMAT = ra,TRUE,-x:rb,TRUE,:rc,TRUE:rd,TRUE,-x");
    EXPECT_THROW(TessalCmdargs::createCommandMap(), DataMismatchException) << "rc without a format";
    EXPECT_THAT(matching("r"), ElementsAre("ra", "rb")) << "the rows before it are kept";
    const MessageRecorder messages;
    EXPECT_THROW(parse("ra", true), InvalidArgumentException);
    EXPECT_FALSE(messages.info().empty());
    EXPECT_NE(parse("ra", false)->iserror(), 0);
    EXPECT_STREQ(parse("RA -x", false)->command(), "RA") << "the arguments are passed on unchanged";
    EXPECT_THROW(parse("rb", false), ACDEntryNotFoundException) << "an empty format is none";
    EXPECT_THROW(parse("unknown", false), ACDEntryNotFoundException);
    EXPECT_THROW(TessalCmdargs::getCmdargs(0, nullptr, false), ACDEntryNotFoundException);
    char* const noWord[] = {nullptr};
    EXPECT_THROW(TessalCmdargs::getCmdargs(1, noWord, false), ACDEntryNotFoundException);
}

TEST(TessalCmdargs, TheShippedCommandsHaveSoundFormats) {
    DeviceProfile::setDataPath(SHIPPED_DATA_DIR);
    TessalCmdargs::createCommandMap();
    DeviceProfile::setDataPath(nullptr);
    for (const HkString& name : TessalCmdargs::findAllCommands()) {
        EXPECT_STREQ(HkCmdArgs::checkFormat(TessalCmdargs::findFormatString(name)), "") << name;
    }
}

}  // namespace
