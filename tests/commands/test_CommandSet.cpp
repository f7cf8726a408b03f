#include "CommandSet.h"

#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include <cmath>
#include <memory>
#include <string>
#include <tuple>
#include <utility>
#include <vector>

#include "MessageRecorder.h"
#include "TessalException.h"
#include "TokeniserModel.h"

namespace {

using testing::ElementsAre;
using Words = std::vector<std::string>;

Words wordsOf(const CommandSet& commands) {
    Words words;
    for (int i = 0; i < commands.getNumberCommands(); ++i) {
        words.emplace_back(commands.getCommand(i));
    }
    return words;
}

/// The set of a line's tokens, which has at least one.
CommandSet setOf(const char* line) {
    return *std::unique_ptr<CommandSet>(CommandSet::string2CommandSet(line));
}

Words split(const char* line) {
    const std::unique_ptr<CommandSet> commands(CommandSet::string2CommandSet(line));
    return commands != nullptr ? wordsOf(*commands) : Words();
}

TEST(CommandSet, AnOpenQuotationIsRefusedWithItsText) {
    EXPECT_EQ(split(nullptr), Words());
    const MessageRecorder messages;
    EXPECT_THROW(split("cmd x\"abc d"), DataMismatchException);
    EXPECT_THROW(split("\""), DataMismatchException);
    EXPECT_THAT(messages.info(),
                ElementsAre("Missing closing quotation mark abc d.\n", "Missing closing quotation mark .\n"));
    EXPECT_EQ(messages.all().at(0).file, "../s/CommandSet");
}

// All lines up to eight characters of an alphabet with one character of each kind, and up to five of one with more. The
// zero of an alphabet ends a line, so that those that are shorter are among them.
TEST(CommandSet, SplitsAllShortLinesAsTheModelDoes) {
    const std::pair<std::string, int> alphabets[] = {{{"\0a\" #", 5}, 8}, {{"\0a\"\t\n\r\v\\\xFF", 9}, 5}};
    MessageRecorder messages;
    for (const auto& [alphabet, length] : alphabets) {
        const auto lines = static_cast<std::size_t>(std::pow(alphabet.size(), length));
        for (std::size_t number = 0; number < lines; ++number) {
            std::string line;
            for (std::size_t rest = number; rest > 0; rest /= alphabet.size()) {
                line += alphabet[rest % alphabet.size()];
            }
            const std::optional<Words> expected = splitByModel(line);
            if (expected) {
                ASSERT_EQ(split(line.c_str()), *expected) << line;
            } else {
                ASSERT_THROW(split(line.c_str()), DataMismatchException) << line;
                messages.clear();
            }
        }
    }
}

TEST(CommandSet, TakesLongLinesAndManyTokens) {
    std::string line = std::string(1 << 20, 'w') + " ";
    for (int i = 0; i < 100000; ++i) {
        line += std::to_string(i) + "\t\"q q\" ";
    }
    const Words words = split(line.c_str());
    ASSERT_EQ(words.size(), 200001U);
    EXPECT_TRUE(words[0].size() == 1 << 20 && words[199999] == "99999" && words.back() == "q q");
}

TEST(CommandSet, GrowsAndKeepsItsTokens) {
    static_assert(sizeof(CommandSet) == 2 * sizeof(int) + sizeof(void*), "callers count on the layout");
    CommandSet commands(1);
    commands.addCommand("first");
    const char* const first = commands.getCommand(0);
    for (int value = -4; value < 12; ++value) {
        commands.addCommand(value);
    }
    EXPECT_TRUE(commands.getNumberCommands() == 17 && commands.getCommand(17) == nullptr);
    EXPECT_TRUE(commands.getCommand(0) == first && commands.getCommands()[0] == first);
    EXPECT_STREQ(commands.getCommand(1), "-4");
    commands.addCommand(static_cast<const char*>(nullptr));
    EXPECT_STREQ(commands.getCommand(17), "");
}

TEST(CommandSet, CopiesAreIndependent) {
    CommandSet source = setOf("a b");
    CommandSet copy(source);
    copy.resetCommand(0, "other");
    CommandSet assigned = setOf("x");
    assigned = source;
    assigned = *&assigned;
    assigned.addCommand("c");
    source.resetCommand(1, source.getCommand(1));
    EXPECT_THAT(wordsOf(source), ElementsAre("a", "b"));
    EXPECT_THAT(wordsOf(copy), ElementsAre("other", "b"));
    EXPECT_THAT(wordsOf(assigned), ElementsAre("a", "b", "c"));
    EXPECT_THROW(source.resetCommand(2, "c"), OutOfRangeException);
}

constexpr const char* lowest = "Position should start from 1.\n";
constexpr const char* noNumber = "Expect an integer after -p|-position.\n";
// The tokens, then what they are a position higher, and a position lower, with the message of a refused step down.
const std::tuple<const char*, const char*, const char*, const char*> positionCases[] = {
    {"cmd 7 -p 1 2 -file x 3 -pos 4", "cmd 7 -p 2 3 -file x 3 -pos 4", "cmd 7 -p 0 1 -file x 3 -pos 4", nullptr},
    {"-POSITION 9", "-POSITION 10", "-POSITION 8", nullptr},
    {"-p 0", "-p 1", "-p 0", lowest},
    {"-p x", "-p 1", "-p x", noNumber},
    {"-p x\"\"", "-p 1", "-p x\"\"", noNumber},
    {"-p 2 x 3", "-p 3 1 4", "-p 1 x 3", noNumber},
    {"-p 2147483647", "-p 2147483647", "-p 2147483646", nullptr},
};

TEST(CommandSet, MovesPositionsByOne) {
    for (const auto& [before, incremented, decremented, message] : positionCases) {
        const MessageRecorder messages;
        CommandSet up = setOf(before);
        EXPECT_TRUE(up.incrementPositions() && messages.all().empty()) << before;
        EXPECT_EQ(wordsOf(up), split(incremented));
        CommandSet down = setOf(before);
        EXPECT_EQ(down.decrementPositions(), message == nullptr) << before;
        EXPECT_EQ(wordsOf(down), split(decremented));
        EXPECT_EQ(messages.info(), message != nullptr ? Words{message} : Words()) << before;
    }
    EXPECT_TRUE(CommandSet().incrementPositions() && CommandSet().decrementPositions());
}

TEST(CommandSet, PrintsItsLine) {
    const MessageRecorder messages;
    const CommandSet commands = setOf("a %s \"b c\"");
    commands.printCommands(true);
    commands.printCommands(false);
    CommandSet().printCommands(true);
    EXPECT_THAT(messages.info(), ElementsAre("Command: a %s b c \n", "Command: \n"));
    EXPECT_THAT(messages.debug(), ElementsAre("Command: a %s b c \n"));
}

}  // namespace
