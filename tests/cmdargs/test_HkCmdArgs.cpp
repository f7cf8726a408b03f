// The parser against the blocks of docs/argument-format.md and tests/data/cmdargs/cases.md, and what no block can show.

#include "HkCmdArgs.h"

#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include <algorithm>
#include <iomanip>
#include <sstream>
#include <string>
#include <tuple>
#include <vector>

#include "Blocks.h"
#include "MessageRecorder.h"

namespace {

using testing::ElementsAre;
using testing::HasSubstr;
using testing::SizeIs;
using Lines = std::vector<std::string>;

/// Splits at blanks; double quotes round a word hold it together.
Lines splitCommand(const std::string& line) {
    Lines words;
    std::istringstream in(line);
    for (std::string word; in >> std::quoted(word);) {
        words.push_back(word);
    }
    return words;
}

/// The words as a program gets them; they live as long as @p words.
std::vector<const char*> pointersTo(const Lines& words) {
    std::vector<const char*> pointers(words.size());
    std::transform(words.begin(), words.end(), pointers.begin(), [](const std::string& word) { return word.c_str(); });
    return pointers;
}

HkCmdArgs parsed(const char* format, const Lines& words, unsigned short flags = HkCmdArgs::Quiet,
                 void (*callback)() = nullptr) {
    return HkCmdArgs(static_cast<int>(words.size()), pointersTo(words).data(), format, callback, flags);
}

std::string groupDump(const HkCmdArgs& args, const HkCmdArgInfo& info, const char* format, int index) {
    std::string text = "{" + std::string(args.groupLeader(info.names[0], index).view());
    // The members are not part of the description: ask for each word that the format holds.
    for (const std::string& word : splitCommand(format)) {
        const std::string member = word.substr(0, word.find_first_of("*>"));
        if (args.groupHas(info.names[0], member.c_str(), index) && text.find(" " + member) == std::string::npos) {
            const bool hasText = word.find('*') != std::string::npos;
            const std::string carried(args.groupText(info.names[0], member.c_str(), index).view());
            text += " " + member + (hasText ? "(" + carried + ")" : "");
        }
    }
    return text + "}";
}

std::string dumpOne(const HkCmdArgs& args, const HkCmdArgInfo& info, const char* format) {
    const char* const name = info.names[0];
    std::string line = *name != '\0' ? name : "\"\"";
    if (args.count(name) > 1 && info.kind != HkCmdArgInfo::Kind::Positional) {
        line += " x" + std::to_string(args.count(name));
    }
    for (int i = 0; i < args.valueCount(name); ++i) {
        const bool isGroup = info.type == HkCmdArgInfo::Type::Group;
        line += i == 0 ? " = " : " ";
        line += isGroup ? groupDump(args, info, format, i) : args.text(name, i);
    }
    return line;
}

/// The errors, each behind "! "; without errors what was given, in the order of the command.
Lines dump(const HkCmdArgs& args, const char* format) {
    Lines lines;
    for (const HkString& error : args.errors()) {
        lines.push_back("! " + std::string(error.view()));
    }
    if (!lines.empty()) {
        return lines;
    }
    const std::vector<HkCmdArgInfo> infos = HkCmdArgs::describe(format);
    for (const HkString& name : args.order()) {
        const auto info =
            std::find_if(infos.begin(), infos.end(), [&](const auto& one) { return one.names[0] == name; });
        const std::string line = dumpOne(args, *info, format);
        if (std::find(lines.begin(), lines.end(), line) == lines.end()) {
            lines.push_back(line);
        }
    }
    return lines;
}

/// What a command line gives.
Lines parse(const char* format, const std::string& line) {
    return dump(parsed(format, splitCommand(line)), format);
}

/// A line of a block and what it gives: a format its fault, a command its dump, a part of a command the words that may
/// stand in the place of its last one, a command word its help. Any other line is such an answer and gives nothing.
std::string asked(const std::string& line, std::string& format) {
    const std::size_t blank = std::min(line.find(' '), line.size());
    const std::string question = line.substr(0, blank);
    const std::string rest = line.substr(std::min(blank + 1, line.size()));
    std::ostringstream answer;
    answer << line << '\n';
    if (question == "format") {
        format = rest;
        const HkString fault = HkCmdArgs::checkFormat(format.c_str());
        answer << (fault.IsEmpty() ? "" : "! " + std::string(fault) + '\n');
    } else if (question == "$") {
        for (const std::string& result : parse(format.c_str(), rest)) {
            answer << result << '\n';
        }
    } else if (question == "?") {
        const Lines words = splitCommand(rest);
        for (const HkString& next :
             HkCmdArgs::complete(static_cast<int>(words.size()), pointersTo(words).data(), format.c_str())) {
            answer << next << '\n';
        }
    } else if (question == "help") {
        answer << HkCmdArgs::help(rest.c_str(), format.c_str());
    } else {
        return "";
    }
    return answer.str();
}

TEST(HkCmdArgs, GivesWhatTheDocumentsShow) {
    for (const char* const path : {SHIPPED_DATA_DIR "/../docs/argument-format.md", TEST_DATA_DIR "/cmdargs/cases.md"}) {
        std::string shown;
        std::string given;
        std::string format;
        for (const Lines& block : blocksOf(path, "args")) {
            for (const std::string& line : block) {
                shown += line + '\n';
                given += asked(line, format);
            }
        }
        EXPECT_THAT(shown, SizeIs(testing::Gt(3000U))) << path;
        EXPECT_EQ(given, shown) << path;
    }
}

TEST(HkCmdArgs, ReadsTypedValues) {
    const HkCmdArgs args = parsed("-n|-number <text>... [-u <hex>] [-x <mcs|exo>] [<file>]",
                                  splitCommand("CMD -n -2 0x10 abc -u 0xFFFFFFFFFFFFFFFF -x EXO"));
    ASSERT_EQ(args.iserror(), 0);
    EXPECT_STREQ(args.command(), "CMD");
    EXPECT_TRUE(args.integer("-NUMBER", 0) == -2 && args.integer("-n", 1) == 16 && args.integer("-n", 2, 7) == 7);
    EXPECT_TRUE(args.hex("-n", 2) == 0xABC && args.hex("-u") == UINT64_MAX);
    EXPECT_STREQ(args.text("-x"), "exo");
    EXPECT_THAT(args.list("-n"), ElementsAre("-2", "0x10", "abc"));
    for (const char* const absent : {"file", "-none", "", static_cast<const char*>(nullptr)}) {
        EXPECT_EQ(args.text(absent), nullptr);
        EXPECT_STREQ(args.text(absent, 0, "else"), "else");
        EXPECT_EQ(args.hex(absent, 0, 5), 5U);
        EXPECT_TRUE(args.groupLeader(absent).IsEmpty());
    }
    EXPECT_FALSE(args.groupHas("-n", "abc"));
}

int calls = 0;
void countCall() {
    ++calls;
}

TEST(HkCmdArgs, ReportsErrorsAndTheUsageLineAsTheFlagsSay) {
    MessageRecorder recorder;
    calls = 0;
    const Lines words{"cmd", "-pos", "1"};
    EXPECT_EQ(parsed("-position <int>", words, 0, &countCall).iserror() + calls, 0);
    parsed("-position <int>", words, HkCmdArgs::NoAbbreviation | HkCmdArgs::Quiet, &countCall);
    EXPECT_EQ(calls, 1);
    EXPECT_TRUE(recorder.all().empty());
    const HkCmdArgs args = parsed("-pos -x", words, HkCmdArgs::NoUsage);
    EXPECT_THAT(recorder.info(), ElementsAre("cmd: unexpected argument \"1\"\n", "cmd: -x is missing\n"));
    EXPECT_TRUE(args.isGiven("-pos")) << "what was understood can be read";
    recorder.clear();
    parsed("[-x]", words, 0, &countCall);
    EXPECT_THAT(recorder.info(), ElementsAre("cmd: unknown switch \"-pos\"\n", "usage: cmd [-x]\n"));
    EXPECT_EQ(recorder.all().front().file, "../s/HkCmdArgs");
    EXPECT_EQ(calls, 2);
}

TEST(HkCmdArgs, BadCallsAreErrors) {
    const char* const holes[] = {"cmd", nullptr, "-p", nullptr, "2"};
    const std::tuple<int, const char* const*, const char*, Lines> cases[] = {
        {-5, holes, "-p <int>", {"! there is no command word"}},
        {5, nullptr, "-p <int>", {"! there is no command word"}},
        {1, holes + 1, "-p <int>", {"! there is no command word"}},
        {5, holes, nullptr, {"! there is no argument format"}},
        {5, holes, "-p <int>", {"! argument 1 is null", "! argument 3 is null"}},
    };
    for (const auto& [argc, argv, format, errors] : cases) {
        const HkCmdArgs args(argc, argv, format, nullptr, HkCmdArgs::Quiet);
        EXPECT_EQ(dump(args, format), errors);
        EXPECT_THAT(args.usage().c_str(), HasSubstr("usage: "));
    }
    EXPECT_TRUE(HkCmdArgs::complete(1, holes, "[-p]").empty());
    EXPECT_TRUE(HkCmdArgs::describe(nullptr).empty());
    EXPECT_EQ(HkCmdArgs::nearest(nullptr, {"", "program"}), nullptr);
}

TEST(HkCmdArgs, DescribesEachArgument) {
    using testing::FieldsAre;
    using testing::IsEmpty;
    using Kind = HkCmdArgInfo::Kind;
    using Type = HkCmdArgInfo::Type;
    const char* const format =
        "-a|-all [-m <mode=x|y> 'one or the other']... [-v [<level=int>]] \"on\" <size=hex 2>...";
    EXPECT_THAT(HkCmdArgs::describe(format),
                ElementsAre(FieldsAre(Kind::Switch, ElementsAre("-a", "-all"), Type::None, "", "", IsEmpty(), true,
                                      false, false, false, ""),
                            FieldsAre(Kind::Switch, ElementsAre("-m"), Type::Choice, "mode", "one of x, y",
                                      ElementsAre("x", "y"), false, true, false, false, "one or the other"),
                            FieldsAre(Kind::Switch, ElementsAre("-v"), Type::Integer, "level", "an integer", IsEmpty(),
                                      false, false, false, true, ""),
                            FieldsAre(Kind::Word, ElementsAre("on"), Type::None, "", "", IsEmpty(), true, false, false,
                                      false, ""),
                            FieldsAre(Kind::Positional, ElementsAre("size"), Type::Hex, "size",
                                      "a hexadecimal number of 2 digits", IsEmpty(), true, false, true, false, "")));
}

TEST(HkCmdArgs, ManyErrorsAreCutAndLongTokensShortened) {
    const MessageRecorder recorder;
    EXPECT_EQ(parsed("[-p]", Lines(100001, "wrong\n"), HkCmdArgs::NoUsage).errorCount(), 100000);
    ASSERT_THAT(recorder.info(), SizeIs(11));
    EXPECT_EQ(recorder.info()[0], "wrong\\x0A: unexpected argument \"wrong\\x0A\"\n");
    EXPECT_EQ(recorder.info()[10], "wrong\\x0A: and 99990 more errors\n");

    const std::string giant = "-" + std::string(1 << 20, '\xC3');
    EXPECT_THAT(parse("[-p]", "cmd " + giant)[0], SizeIs(testing::Lt(120U)));
    EXPECT_THAT(parse("-p", "cmd -" + std::string(78, 'a') + "\xC3\xA4"),
                ElementsAre(HasSubstr("aaa...\""), "! -p is missing"));
}

TEST(HkCmdArgs, HundredThousandSwitchesAndFormatsBeyondTheCache) {
    Lines words{"cmd"};
    for (int i = 0; i < 50000; ++i) {
        words.insert(words.end(), {"-p", std::to_string(i), "-name", "nnn"});
    }
    const HkCmdArgs args = parsed("(-p <int>)... (-name <text>)...", words);
    EXPECT_EQ(args.integer("-p", 49999), 49999);
    EXPECT_THAT(args.order(), SizeIs(100000));
    for (int i = 0; i < 600; ++i) {
        const std::string name = "-switch" + std::to_string(i);
        ASSERT_THAT(parse(name.c_str(), "cmd " + name), ElementsAre(name));
    }
    EXPECT_THAT(parse(("-p '" + std::string(1 << 20, 'h') + "'").c_str(), "cmd -p"), ElementsAre("-p"));
}

}  // namespace
