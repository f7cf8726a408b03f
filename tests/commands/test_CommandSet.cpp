#include "CommandSet.h"

#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include <memory>
#include <string>
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

Words split(const char* line) {
    const std::unique_ptr<CommandSet> commands(CommandSet::string2CommandSet(line));
    return commands != nullptr ? wordsOf(*commands) : Words();
}

CommandSet setOf(const Words& words) {
    CommandSet commands;
    for (const std::string& word : words) {
        commands.addCommand(word.c_str());
    }
    return commands;
}

struct TokeniserCase {
    const char* name;
    const char* line;
    Words words;
};

const TokeniserCase tokeniserCases[] = {
    {"null", nullptr, {}},
    {"empty", "", {}},
    {"comment", "# cmd", {}},
    {"comment sign elsewhere", "a #b", {"a", "#b"}},
    {"comment sign behind a blank", " # b", {"#", "b"}},
    {"blanks only", " \t\r\n ", {}},
    {"leading separators", "\t  cmd", {"cmd"}},
    {"every separator, at the end too", "cmd  -p\t1\r\n", {"cmd", "-p", "1"}},
    {"other control characters are letters", "a\vb\fc\x01", {"a\vb\fc\x01"}},
    {"high bytes are letters", "\xC3\xA4 \xFF\xA0", {"\xC3\xA4", "\xFF\xA0"}},
    {"quoted words", "cmd \"two words\" x", {"cmd", "two words", "x"}},
    {"quoted blank", "cmd \" \"", {"cmd", " "}},
    {"quoted first", "\"a b\" c", {"a b", "c"}},
    {"letters before a quote are dropped, behind it they are a token", "a\"b c\"d", {"b c", "d"}},
    {"quotation next to quotation", "\"a\"\"b\"", {"a", "b"}},
    {"backslash is a letter", "a\\ \"b\\\"", {"a\\", "b\\"}},
    {"empty quotes behind a separator", "cmd \"\" x", {"cmd", "x"}},
    {"empty quotes behind a quotation", "cmd \"a\"\"\" x", {"cmd", "a", "x"}},
    {"empty quotes behind dropped letters", "cmd -u\"\" x", {"cmd", "", "x"}},
    {"empty quotes first", "\"\" cmd", {"cmd"}},
    {"no empty command word", "a\"\" cmd", {"cmd"}},
    {"empty quotes alone", "\"\"", {}},
};

TEST(CommandSet, SplitsALine) {
    for (const TokeniserCase& c : tokeniserCases) {
        EXPECT_EQ(split(c.line), c.words) << c.name;
        EXPECT_EQ(splitByModel(c.line != nullptr ? c.line : ""), c.words) << "model: " << c.name;
    }
}

TEST(CommandSet, RefusesAnOpenQuotation) {
    const MessageRecorder messages;
    EXPECT_THROW(CommandSet::string2CommandSet("cmd x\"abc d"), DataMismatchException);
    EXPECT_THROW(CommandSet::string2CommandSet("\""), DataMismatchException);
    EXPECT_THAT(messages.info(),
                ElementsAre("Missing closing quotation mark abc d.\n", "Missing closing quotation mark .\n"));
    EXPECT_EQ(messages.all().at(0).file, "../s/CommandSet");
}

// All lines up to eight characters of an alphabet with one character of each kind.
TEST(CommandSet, SplitsAllShortLinesAsTheModelDoes) {
    const std::string alphabet = "a\" #";
    MessageRecorder messages;
    for (std::size_t length = 1; length <= 8; ++length) {
        const std::size_t lines = std::size_t{1} << (2 * length);
        for (std::size_t number = 0; number < lines; ++number) {
            std::string line;
            for (std::size_t i = 0; i < length; ++i) {
                line += alphabet[(number >> (2 * i)) & 3];
            }
            const std::optional<Words> expected = splitByModel(line);
            if (expected) {
                ASSERT_EQ(split(line.c_str()), *expected) << line;
            } else {
                ASSERT_THROW(CommandSet::string2CommandSet(line.c_str()), DataMismatchException) << line;
                messages.clear();
            }
        }
    }
}

TEST(CommandSet, TakesLongLinesAndManyTokens) {
    const std::string word(1 << 20, 'w');
    EXPECT_EQ(split(word.c_str()), Words{word});
    EXPECT_EQ(split(("\"" + word + " \"").c_str()), Words{word + " "});
    std::string line;
    for (int i = 0; i < 100000; ++i) {
        line += std::to_string(i) + (i % 2 == 0 ? " " : "\t\"q q\" ");
    }
    const Words words = split(line.c_str());
    ASSERT_EQ(words.size(), 150000U);
    EXPECT_EQ(words.back(), "q q");
    EXPECT_EQ(words[149998], "99999");
}

TEST(CommandSet, GrowsByDoublingAndKeepsItsTokens) {
    CommandSet commands(1);
    commands.addCommand("first");
    const char* const first = commands.getCommand(0);
    for (int value = -4; value < 12; ++value) {
        commands.addCommand(value);
    }
    EXPECT_EQ(commands.getNumberCommands(), 17);
    EXPECT_EQ(commands.getCommand(0), first);
    EXPECT_EQ(commands.getCommands()[0], first);
    EXPECT_STREQ(commands.getCommand(1), "-4");
    EXPECT_EQ(commands.getCommand(17), nullptr);
    commands.addCommand(static_cast<const char*>(nullptr));
    EXPECT_STREQ(commands.getCommand(17), "");
}

TEST(CommandSet, HasTheLayoutThatItsCallersRead) {
    struct Layout {
        int count;
        int capacity;
        char** tokens;
    };
    static_assert(sizeof(Layout) == sizeof(CommandSet));
    CommandSet commands;
    for (int i = 0; i < 9; ++i) {
        commands.addCommand(i);
    }
    Layout layout{};
    std::memcpy(&layout, static_cast<const void*>(&commands), sizeof layout);
    EXPECT_EQ(layout.count, 9);
    EXPECT_EQ(layout.capacity, 16);
    EXPECT_EQ(layout.tokens, commands.getCommands());
}

TEST(CommandSet, CopiesAreIndependent) {
    CommandSet source = setOf({"a", "b"});
    CommandSet copy(source);
    copy.resetCommand(0, "other");
    CommandSet assigned = setOf({"x"});
    assigned = source;
    assigned = *&assigned;
    assigned.addCommand("c");
    EXPECT_THAT(wordsOf(source), ElementsAre("a", "b"));
    EXPECT_THAT(wordsOf(copy), ElementsAre("other", "b"));
    EXPECT_THAT(wordsOf(assigned), ElementsAre("a", "b", "c"));
}

TEST(CommandSet, ResetReplacesATokenOrSaysThatThereIsNone) {
    CommandSet commands = setOf({"a", "b"});
    commands.resetCommand(1, commands.getCommand(1));
    EXPECT_THAT(wordsOf(commands), ElementsAre("a", "b"));
    EXPECT_THROW(commands.resetCommand(2, "c"), OutOfRangeException);
}

struct PositionCase {
    const char* name;
    Words before;
    Words incremented;
    Words decremented;
    const char* message;  ///< of decrementPositions, which then yields false; null where it yields true
};

const PositionCase positionCases[] = {
    {"empty set", {}, {}, {}, nullptr},
    {"no position", {"cmd", "3"}, {"cmd", "3"}, {"cmd", "3"}, nullptr},
    {"a list ends at the next switch",
     {"assign", "-p", "1", "2", "-file", "x", "3"},
     {"assign", "-p", "2", "3", "-file", "x", "3"},
     {"assign", "-p", "0", "1", "-file", "x", "3"},
     nullptr},
    {"long name, any case", {"-POSITION", "9"}, {"-POSITION", "10"}, {"-POSITION", "8"}, nullptr},
    {"only the whole switch", {"-pos", "9"}, {"-pos", "9"}, {"-pos", "9"}, nullptr},
    {"zero", {"-p", "0"}, {"-p", "1"}, {"-p", "0"}, "Position should start from 1.\n"},
    {"no number", {"-p", "x"}, {"-p", "1"}, {"-p", "x"}, "Expect an integer after -p|-position.\n"},
    {"empty", {"-p", ""}, {"-p", "1"}, {"-p", ""}, "Expect an integer after -p|-position.\n"},
    {"stops at the first fault",
     {"-p", "2", "x", "3"},
     {"-p", "3", "1", "4"},
     {"-p", "1", "x", "3"},
     "Expect an integer after -p|-position.\n"},
    {"stays within 32 bits", {"-p", "2147483647"}, {"-p", "2147483647"}, {"-p", "2147483646"}, nullptr},
};

TEST(CommandSet, MovesPositionsByOne) {
    for (const PositionCase& c : positionCases) {
        const MessageRecorder messages;
        CommandSet up = setOf(c.before);
        EXPECT_TRUE(up.incrementPositions()) << c.name;
        EXPECT_EQ(wordsOf(up), c.incremented) << c.name;
        EXPECT_TRUE(messages.all().empty()) << c.name;
        CommandSet down = setOf(c.before);
        EXPECT_EQ(down.decrementPositions(), c.message == nullptr) << c.name;
        EXPECT_EQ(wordsOf(down), c.decremented) << c.name;
        EXPECT_EQ(messages.info(), c.message != nullptr ? Words{c.message} : Words()) << c.name;
    }
}

TEST(CommandSet, PrintsItsLine) {
    const MessageRecorder messages;
    const CommandSet commands = setOf({"a", "%s", "b c"});
    commands.printCommands(true);
    commands.printCommands(false);
    CommandSet().printCommands(true);
    EXPECT_THAT(messages.info(), ElementsAre("Command: a %s b c \n", "Command: \n"));
    EXPECT_THAT(messages.debug(), ElementsAre("Command: a %s b c \n"));
}

}  // namespace
