#include "HkCmdArgs.h"

#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include <fstream>
#include <string>
#include <tuple>
#include <utility>
#include <vector>

#include "MessageRecorder.h"
#include "cmdargs/Dump.h"

namespace {

using testing::ElementsAre;
using testing::HasSubstr;
using testing::SizeIs;

constexpr const char* program =
    "'Programs devices.' -p|-position <device=int 1..255>... 'device positions' [-e|-erase 'erase first'] "
    "[-format <mcs|exo|tek>] [-ver <revision=group 0|1 rp code*>]... [{-fast -slow}] [<file> 'the device''s image']";
const std::string usageLine =
    "usage: program -p|-position <device>... [-e|-erase] [-format <mcs|exo|tek>] [-ver <revision>]... [-fast | -slow] "
    "[<file>]\n";

int calls = 0;
void countCall() {
    ++calls;
}

// The blocks of docs/argument-format.md hold formats, commands, and what these give.
TEST(HkCmdArgs, GivesWhatTheDocumentShows) {
    std::ifstream file(SHIPPED_DATA_DIR "/../docs/argument-format.md");
    Lines shown;
    Lines given;
    std::string format;
    bool inside = false;
    for (std::string line; std::getline(file, line);) {
        line.erase(line.find_last_not_of(" \r") + 1);
        if (line.rfind("```", 0) == 0) {
            inside = line == "```args";
        } else if (inside) {
            const bool isCommand = line.rfind("$ ", 0) == 0;
            const bool isFormat = line.rfind("format ", 0) == 0;
            format = isFormat ? line.substr(7) : format;
            shown.push_back(line);
            given.insert(given.end(), isCommand || isFormat ? 1 : 0, line);
            const Lines results = isCommand ? parse(format.c_str(), line.substr(2)) : Lines();
            given.insert(given.end(), results.begin(), results.end());
        }
    }
    EXPECT_GT(shown.size(), 80U);
    EXPECT_EQ(given, shown);
}

TEST(HkCmdArgs, MalformedFormatsTellPlaceAndReason) {
    const std::pair<const char*, const char*> cases[] = {
        {"-p <n=itn>", "character 4: unknown type itn"},
        {"-p <n=int 5..1>", "character 4: expected a range such as 1..255, not 5..1"},
        {"-p <hex 0>", "character 4: expected a range such as 1..255, not 0"},
        {"-p <n=int 1..2 3>", "character 4: unexpected 3"},
        {"-p <group |>", "character 4: expected the first words of the group, such as group 0|1 rp wp"},
        {"-p <>", "character 4: expected a name or a type between < and >"},
        {"-p <a b=int>", "character 4: expected <name=type>"},
        {"-p <n", "character 4: the argument has no closing >"},
        {"<-n>", "character 1: the name of an argument begins with no dash"},
        {"[-p)", "character 4: expected ]"},
        {"(-p]", "character 4: expected )"},
        {"{-p -q", "character 1: expected } behind at least two arguments"},
        {"[]", "character 2: expected a -switch, a \"word\" or an <argument>"},
        {"-p --", "character 4: expected the name of a switch, a dash and letters"},
        {"-p [-P]", "character 5: the name -p stands twice"},
        {"<file> \"FILE\"", "character 8: the name file stands twice"},
        {"\"up", "character 1: the word has no closing \""},
        {"-p 'help", "character 4: the help text has no closing '"},
        {"[-p 'a'] 'b'", "character 10: a second help text"},
        {"[<a>] <b>", "character 7: the required <b> stands behind an optional one"},
        {"<a>... [<b>]", "character 9: no argument can follow the list before <b>"},
        {"-p 'a, b'", "character 6: the characters comma and colon cannot stand in a format"},
    };
    for (const auto& [format, error] : cases) {
        const std::string expected = std::string("the argument format is malformed at ") + error;
        EXPECT_EQ(HkCmdArgs::checkFormat(format), expected.c_str()) << format;
        EXPECT_THAT(parse(format, "cmd -p 1"), ElementsAre("! " + expected)) << format;
        EXPECT_EQ(HkCmdArgs::help("cmd", format), "usage: cmd\n") << format;
    }
    for (const char* const format : {program, "", " \t -a|\n-b\r\n[ -c [ < n = int 1.. > ] ] "}) {
        EXPECT_TRUE(HkCmdArgs::checkFormat(format).IsEmpty()) << format;
    }
}

TEST(HkCmdArgs, ValuesAtTheEdgesOfTheirTypes) {
    const std::tuple<const char*, Lines, Lines> cases[] = {
        {"<n=int>",
         {"-9223372036854775808", "0x7FFFFFFFFFFFFFFF", "+1"},
         {"-9223372036854775809", "9223372036854775808", "0x", "-", " 1", "1 "}},
        {"<n=int ..-2>", {"-2"}, {"-1"}},
        {"<n=int 3>", {"3"}, {"4"}},
        {"<n=hex 8>", {"0x0123abCD"}, {"123abCD"}},
        {"<n=hex>", {"0123456789abcdef0123456789ABCDEF"}, {"12g", "0x"}},
        {"<n=text 2..>", {"ab"}, {"a"}},
        {"<n=a|b|>", {"B"}, {"", "c"}},
        {"<n=group a|b c* d>", {" A  d  c:x:y d"}, {"", "c:x", "a c", "a d:"}},
    };
    for (const auto& [format, fitting, unfit] : cases) {
        for (const Lines* const values : {&fitting, &unfit}) {
            for (const std::string& value : *values) {
                const bool isFitting = parsed(format, {"cmd", "--", value}).iserror() == 0;
                EXPECT_EQ(isFitting, values == &fitting) << format << " " << value;
            }
        }
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

TEST(HkCmdArgs, ReportsEachErrorAsInfoThenTheUsageLine) {
    const MessageRecorder recorder;
    calls = 0;
    const HkCmdArgs args =
        parsed(program, splitCommand("program -erse x -format mcx -fast -slow -f -e=1 -E"), 0, &countCall);
    EXPECT_THAT(recorder.info(),
                ElementsAre("program: unknown switch \"-erse\"; did you mean -erase?\n",
                            "program: -format needs one of mcs, exo, tek, not \"mcx\"; did you mean mcs?\n",
                            "program: switch \"-f\" is short for -format or -fast: write more of it\n",
                            "program: -e|-erase takes no value, but was given \"1\"\n",
                            "program: -e|-erase is given more than once\n",
                            "program: -p|-position <device>... is missing: device positions\n",
                            "program: -fast and -slow exclude each other\n", usageLine));
    EXPECT_EQ(recorder.all().front().file, "../s/HkCmdArgs");
    EXPECT_EQ(calls, 1);
    EXPECT_THAT(args.errors(), SizeIs(7));
    EXPECT_TRUE(args.isGiven("-fast")) << "what was understood can be read";
}

TEST(HkCmdArgs, FlagsAndCallback) {
    const MessageRecorder recorder;
    calls = 0;
    const Lines words{"cmd", "-pos", "1"};
    EXPECT_EQ(parsed("-position <int>", words, 0, &countCall).iserror() + calls, 0);
    parsed("-position <int>", words, HkCmdArgs::NoAbbreviation | HkCmdArgs::Quiet, &countCall);
    EXPECT_EQ(calls, 1);
    EXPECT_TRUE(recorder.all().empty());
    parsed("", words, HkCmdArgs::NoUsage);
    EXPECT_THAT(recorder.info(), ElementsAre("cmd: unknown switch \"-pos\"\n"));
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
    EXPECT_TRUE(HkCmdArgs::complete(1, holes, program).empty());
    EXPECT_TRUE(HkCmdArgs::describe(nullptr).empty());
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

TEST(HkCmdArgs, HelpSaysWhatEachArgumentIs) {
    EXPECT_EQ(HkCmdArgs::help("program", program).view(),
              usageLine +
                  "\n"
                  "Programs devices.\n"
                  "\n"
                  "  -p|-position <device>...  device positions (an integer from 1 to 255)\n"
                  "  -e|-erase                 erase first\n"
                  "  -format <mcs|exo|tek>     one of mcs, exo, tek\n"
                  "  -ver <revision>           one argument of the form \"0|1 [rp] [code:<text>]\"\n"
                  "  -fast\n"
                  "  -slow\n"
                  "  <file>                    the device's image (a file name)\n");
    EXPECT_EQ(HkCmdArgs::usage(nullptr, "(-a)... {\"\" <b>...} -c [<int>...]"),
              "usage:  (-a)... {\"\" | <b>...} -c [<int>...]");
    EXPECT_EQ(HkCmdArgs::help("c", "-an-unusually-long-name|-alias <value> 'help' -b"),
              "usage: c -an-unusually-long-name|-alias <value> -b\n\n"
              "  -an-unusually-long-name|-alias <value>\n      help\n  -b\n");
}

TEST(HkCmdArgs, CompletesWhatMayComeNext) {
    const char* const words = "[\"all\"] [<on|off>]";
    const std::tuple<const char*, const char*, const char*, Lines> cases[] = {
        {program, "program", "-", {"-p", "-position", "-e", "-erase", "-format", "-ver", "-fast", "-slow"}},
        {program, "program", "-F", {"-format", "-fast"}},
        {program, "program -e -fast", "", {"-p", "-position", "-format", "-ver"}},
        {program, "program -p", "", {}},
        {program, "program -format", "E", {"exo"}},
        {program, "program", "-format=t", {"-format=tek"}},
        {program, "program", "-x=t", {}},
        {program, "program -ver 0 -ver", "", {"0", "1"}},
        {program, "program --", "-", {}},
        {words, "cmd", "o", {"on", "off"}},
        {words, "cmd on", "", {"all"}},
    };
    for (const auto& [format, line, partial, expected] : cases) {
        Lines given = splitCommand(line);
        given.emplace_back(partial);
        const auto found = HkCmdArgs::complete(static_cast<int>(given.size()), pointersTo(given).data(), format);
        EXPECT_EQ(Lines(found.begin(), found.end()), expected) << line << " " << partial;
    }
}

TEST(HkCmdArgs, NearestWordIsWithinAThird) {
    const std::vector<HkString> words{"program", "verify", ""};
    EXPECT_STREQ(HkCmdArgs::nearest("PRGORAM", words), "program");
    for (const char* const far : {"prog", "er", "", static_cast<const char*>(nullptr)}) {
        EXPECT_EQ(HkCmdArgs::nearest(far, words), nullptr);
    }
}

}  // namespace
