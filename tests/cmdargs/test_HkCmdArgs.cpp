#include "HkCmdArgs.h"

#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include <string>
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

int calls = 0;
void countCall() {
    ++calls;
}

Lines parse(const char* format, const std::string& line) {
    const Lines words = splitCommand(line);
    return dump(HkCmdArgs(static_cast<int>(words.size()), pointersTo(words).data(), format, nullptr, HkCmdArgs::Quiet),
                format);
}

Lines completions(const char* format, const std::string& line, const char* partial) {
    Lines words = splitCommand(line);
    words.emplace_back(partial);
    Lines result;
    const int count = static_cast<int>(words.size());
    for (const HkString& word : HkCmdArgs::complete(count, pointersTo(words).data(), format)) {
        result.emplace_back(word.view());
    }
    return result;
}

TEST(HkCmdArgs, MalformedFormatsTellPlaceAndReason) {
    struct Case {
        const char* format;
        const char* error;
    };
    const Case cases[] = {
        {"-p <n=itn>", "character 4: unknown type itn"},
        {"-p <n=one>", "character 4: unknown type one"},
        {"-p <n=int 5..1>", "character 4: expected a range such as 1..255, not 5..1"},
        {"-p <n=int ..>", "character 4: expected a range such as 1..255, not .."},
        {"-p <hex 0>", "character 4: expected a range such as 1..255, not 0"},
        {"-p <file 1..2>", "character 4: unexpected 1..2"},
        {"-p <n=int 1..2 3>", "character 4: unexpected 3"},
        {"-p <group>", "character 4: expected the first words of the group, such as group 0|1 rp wp"},
        {"-p <group |>", "character 4: expected the first words of the group, such as group 0|1 rp wp"},
        {"-p <>", "character 4: expected a name or a type between < and >"},
        {"-p <a b=int>", "character 4: expected <name=type>"},
        {"-p <n", "character 4: the argument has no closing >"},
        {"<-n>", "character 1: the name of an argument begins with no dash"},
        {"[-p", "character 4: expected ]"},
        {"[-p)", "character 4: expected ]"},
        {"(-p]", "character 4: expected )"},
        {"{-p}", "character 1: expected } behind at least two arguments"},
        {"{-p -q", "character 1: expected } behind at least two arguments"},
        {"[]", "character 2: expected a -switch, a \"word\" or an <argument>"},
        {"-p|q", "character 4: expected the name of a switch, a dash and letters"},
        {"-p --", "character 4: expected the name of a switch, a dash and letters"},
        {"-p [-P]", "character 5: the name -p stands twice"},
        {"<file> \"FILE\"", "character 8: the name file stands twice"},
        {"\"up", "character 1: the word has no closing \""},
        {"-p 'help", "character 4: the help text has no closing '"},
        {"-p 'a' 'b'", "character 8: expected a -switch, a \"word\" or an <argument>"},
        {"[-p 'a'] 'b'", "character 10: a second help text"},
        {"[<a>] <b>", "character 7: the required <b> stands behind an optional one"},
        {"<a>... [<b>]", "character 9: no argument can follow the list before <b>"},
        {"-p 'a, b'", "character 6: the characters comma and colon cannot stand in a format"},
        {"-p:q", "character 3: the characters comma and colon cannot stand in a format"},
    };
    for (const Case& row : cases) {
        const std::string expected = std::string("the argument format is malformed at ") + row.error;
        EXPECT_EQ(HkCmdArgs::checkFormat(row.format), expected.c_str()) << row.format;
        EXPECT_THAT(parse(row.format, "cmd -p 1"), ElementsAre("! " + expected)) << row.format;
        EXPECT_EQ(HkCmdArgs::help("cmd", row.format), "usage: cmd\n") << row.format;
    }
    EXPECT_TRUE(HkCmdArgs::checkFormat(program).IsEmpty());
    EXPECT_TRUE(HkCmdArgs::checkFormat("").IsEmpty());
    EXPECT_TRUE(HkCmdArgs::checkFormat(" \t -a|\n-b\r\n[ -c [ < n = int 1.. > ] ] ").IsEmpty());
}

TEST(HkCmdArgs, ValuesAtTheEdgesOfTheirTypes) {
    struct Case {
        const char* format;
        const char* value;
        bool fits;
    };
    const Case cases[] = {
        {"<n=int>", "-9223372036854775808", true},
        {"<n=int>", "-9223372036854775809", false},
        {"<n=int>", "0x7FFFFFFFFFFFFFFF", true},
        {"<n=int>", "9223372036854775808", false},
        {"<n=int>", "+1", true},
        {"<n=int>", "0x", false},
        {"<n=int>", "-", false},
        {"<n=int>", " 1", false},
        {"<n=int>", "1 ", false},
        {"<n=int ..-2>", "-2", true},
        {"<n=int ..-2>", "-1", false},
        {"<n=int 3>", "3", true},
        {"<n=int 3>", "4", false},
        {"<n=hex 8>", "0x0123abCD", true},
        {"<n=hex 8>", "123abCD", false},
        {"<n=hex>", "0123456789abcdef0123456789ABCDEF", true},
        {"<n=hex>", "12g", false},
        {"<n=hex>", "0x", false},
        {"<n=text 2..>", "a", false},
        {"<n=a|b|>", "B", true},
        {"<n=a|b>", "", false},
        {"<n=group a|b c* d>", " A  d  c:x:y d", true},
        {"<n=group a|b c* d>", "", false},
        {"<n=group a|b c* d>", "c:x", false},
        {"<n=group a|b c* d>", "a c", false},
        {"<n=group a|b c* d>", "a d:", false},
    };
    for (const Case& row : cases) {
        const char* const argv[] = {"cmd", "--", row.value};
        const HkCmdArgs args(3, argv, row.format, nullptr, HkCmdArgs::Quiet);
        EXPECT_EQ(args.iserror() == 0, row.fits) << row.format << " " << row.value;
    }
}

TEST(HkCmdArgs, ReadsTypedValues) {
    const char* const argv[] = {"CMD", "-n", "-2", "0x10", "abc", "-u", "0xFFFFFFFFFFFFFFFF", "-x", "EXO"};
    const HkCmdArgs args(9, argv, "-n|-number <text>... [-u <hex>] [-x <mcs|exo>] [<file>]", nullptr, 0);
    ASSERT_EQ(args.iserror(), 0);
    EXPECT_STREQ(args.command(), "CMD");
    EXPECT_EQ(args.integer("-NUMBER", 0), -2);
    EXPECT_EQ(args.integer("-n", 1), 16);
    EXPECT_EQ(args.hex("-n", 2), 0xABCU);
    EXPECT_EQ(args.integer("-n", 2, 7), 7);
    EXPECT_EQ(args.hex("-u"), 0xFFFFFFFFFFFFFFFFU);
    EXPECT_STREQ(args.text("-x"), "exo");
    EXPECT_THAT(args.list("-n"), ElementsAre("-2", "0x10", "abc"));
    for (const char* const absent : {"file", "-none", "", static_cast<const char*>(nullptr)}) {
        EXPECT_FALSE(args.isGiven(absent));
        EXPECT_EQ(args.text(absent), nullptr);
        EXPECT_STREQ(args.text(absent, 0, "else"), "else");
        EXPECT_EQ(args.hex(absent, 0, 5), 5U);
        EXPECT_TRUE(args.groupLeader(absent).IsEmpty());
    }
    EXPECT_EQ(args.text("-n", 3), nullptr);
    EXPECT_EQ(args.text("-n", -1), nullptr);
    EXPECT_FALSE(args.groupHas("-n", "abc"));
}

TEST(HkCmdArgs, ReportsEachErrorAsInfoThenTheUsageLine) {
    const MessageRecorder recorder;
    const char* const argv[] = {"program", "-erse", "x", "-format", "mcx", "-fast", "-slow", "-f", "-e=1", "-E"};
    calls = 0;
    const HkCmdArgs args(10, argv, program, &countCall, 0);
    EXPECT_THAT(recorder.info(),
                ElementsAre("program: unknown switch \"-erse\"; did you mean -erase?\n",
                            "program: -format needs one of mcs, exo, tek, not \"mcx\"; did you mean mcs?\n",
                            "program: switch \"-f\" is short for -format or -fast: write more of it\n",
                            "program: -e|-erase takes no value, but was given \"1\"\n",
                            "program: -e|-erase is given more than once\n",
                            "program: -p|-position <device>... is missing: device positions\n",
                            "program: -fast and -slow exclude each other\n",
                            "usage: program -p|-position <device>... [-e|-erase] [-format <mcs|exo|tek>] "
                            "[-ver <revision>]... [-fast | -slow] [<file>]\n"));
    EXPECT_EQ(recorder.all().front().file, "../s/HkCmdArgs");
    EXPECT_EQ(calls, 1);
    EXPECT_THAT(args.errors(), SizeIs(7));
    EXPECT_TRUE(args.isGiven("-fast")) << "what was understood can be read";
}

TEST(HkCmdArgs, FlagsAndCallback) {
    const MessageRecorder recorder;
    calls = 0;
    const char* const argv[] = {"cmd", "-pos", "1"};
    EXPECT_EQ(HkCmdArgs(3, argv, "-position <int>", &countCall, 0).iserror(), 0);
    EXPECT_EQ(calls, 0);
    EXPECT_NE(HkCmdArgs(3, argv, "-position <int>", &countCall, HkCmdArgs::NoAbbreviation | HkCmdArgs::Quiet).iserror(),
              0);
    EXPECT_EQ(calls, 1);
    EXPECT_TRUE(recorder.all().empty());
    const HkCmdArgs args(3, argv, "", nullptr, HkCmdArgs::NoUsage);
    EXPECT_THAT(recorder.info(), ElementsAre("cmd: unknown switch \"-pos\"\n"));
}

TEST(HkCmdArgs, BadCallsAreErrors) {
    const char* const holes[] = {"cmd", nullptr, "-p", nullptr, "2"};
    const char* const noCommand[] = {nullptr, "-p"};
    struct Case {
        int argc;
        const char* const* argv;
        const char* format;
        Lines errors;
    };
    const Case cases[] = {
        {0, holes, "-p <int>", {"! there is no command word"}},
        {-5, holes, "-p <int>", {"! there is no command word"}},
        {5, nullptr, "-p <int>", {"! there is no command word"}},
        {2, noCommand, "-p <int>", {"! there is no command word"}},
        {5, holes, nullptr, {"! there is no argument format"}},
        {5, holes, "-p <int>", {"! argument 1 is null", "! argument 3 is null"}},
    };
    for (const Case& row : cases) {
        const HkCmdArgs args(row.argc, row.argv, row.format, nullptr, HkCmdArgs::Quiet);
        EXPECT_NE(args.iserror(), 0);
        EXPECT_EQ(dump(args, row.format), row.errors);
        EXPECT_THAT(args.usage().c_str(), HasSubstr("usage: "));
    }
    EXPECT_TRUE(HkCmdArgs::complete(1, holes, program).empty());
    EXPECT_TRUE(HkCmdArgs::describe(nullptr).empty());
}

TEST(HkCmdArgs, ManyErrorsAreCutAndLongTokensShortened) {
    const MessageRecorder recorder;
    const Lines words(100001, "wrong\n");
    const HkCmdArgs args(100001, pointersTo(words).data(), "[-p]", nullptr, HkCmdArgs::NoUsage);
    EXPECT_EQ(args.errorCount(), 100000);
    ASSERT_THAT(recorder.info(), SizeIs(11));
    EXPECT_EQ(recorder.info()[0], "wrong\\x0A: unexpected argument \"wrong\\x0A\"\n");
    EXPECT_EQ(recorder.info()[10], "wrong\\x0A: and 99990 more errors\n");

    const std::string giant = "-" + std::string(1 << 20, '\xC3');
    EXPECT_THAT(parse("[-p]", "cmd " + giant)[0], SizeIs(testing::Lt(120U)));
    EXPECT_THAT(parse("-p", "cmd -" + std::string(78, 'a') + "\xC3\xA4"),
                ElementsAre(HasSubstr("aaa...\""), "! -p is missing"));
}

TEST(HkCmdArgs, HundredThousandValuesAndSwitches) {
    Lines words{"cmd"};
    for (int i = 0; i < 50000; ++i) {
        words.insert(words.end(), {"-p", std::to_string(i), "-name", std::string(3, 'n')});
    }
    const int count = static_cast<int>(words.size());
    const HkCmdArgs args(count, pointersTo(words).data(), "(-p <int>)... (-name <text>)...", nullptr, 0);
    ASSERT_EQ(args.iserror(), 0);
    EXPECT_EQ(args.count("-p"), 50000);
    EXPECT_EQ(args.integer("-p", 49999), 49999);
    EXPECT_THAT(args.order(), SizeIs(100000));
}

TEST(HkCmdArgs, FormatsBeyondTheCacheStillParse) {
    for (int i = 0; i < 600; ++i) {
        const std::string name = "-switch" + std::to_string(i);
        ASSERT_THAT(parse(name.c_str(), "cmd " + name), ElementsAre(name));
    }
    const std::string giant = "-p '" + std::string(1 << 20, 'h') + "'";
    EXPECT_THAT(parse(giant.c_str(), "cmd -p"), ElementsAre("-p"));
}

TEST(HkCmdArgs, HelpSaysWhatEachArgumentIs) {
    EXPECT_EQ(HkCmdArgs::help("program", program),
              "usage: program -p|-position <device>... [-e|-erase] [-format <mcs|exo|tek>] [-ver <revision>]... "
              "[-fast | -slow] [<file>]\n"
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
    struct Case {
        const char* line;
        const char* partial;
        Lines words;
    };
    const Case cases[] = {
        {"program", "-", {"-p", "-position", "-e", "-erase", "-format", "-ver", "-fast", "-slow"}},
        {"program", "-F", {"-format", "-fast"}},
        {"program -e -fast", "", {"-p", "-position", "-format", "-ver"}},
        {"program -p 1", "-e", {"-e", "-erase"}},
        {"program -p", "", {}},
        {"program -format", "", {"mcs", "exo", "tek"}},
        {"program -format", "E", {"exo"}},
        {"program", "-format=t", {"-format=tek"}},
        {"program", "-x=t", {}},
        {"program -ver 0 -ver", "", {"0", "1"}},
        {"program --", "-", {}},
    };
    for (const Case& row : cases) {
        EXPECT_EQ(completions(program, row.line, row.partial), row.words) << row.line << " " << row.partial;
    }
    EXPECT_EQ(completions("[\"all\"] [<on|off>]", "cmd", "o"), (Lines{"on", "off"}));
    EXPECT_EQ(completions("[\"all\"] [<on|off>]", "cmd on", ""), (Lines{"all"}));
}

TEST(HkCmdArgs, DescribesTheArgumentsOfAFormat) {
    const std::vector<HkCmdArgInfo> infos = HkCmdArgs::describe(program);
    ASSERT_THAT(infos, SizeIs(7));
    EXPECT_THAT(infos[0].names, ElementsAre("-p", "-position"));
    EXPECT_TRUE(infos[0].required && infos[0].list && !infos[0].repeated);
    EXPECT_EQ(infos[0].expected, "an integer from 1 to 255");
    EXPECT_THAT(infos[2].choices, ElementsAre("mcs", "exo", "tek"));
    EXPECT_EQ(infos[3].type, HkCmdArgInfo::Type::Group);
    EXPECT_TRUE(infos[3].repeated);
    EXPECT_EQ(infos[6].kind, HkCmdArgInfo::Kind::Positional);
    EXPECT_EQ(infos[6].help, "the device's image");
}

TEST(HkCmdArgs, NearestWordIsWithinAThird) {
    struct Case {
        const char* word;
        const char* nearest;
    };
    const Case cases[] = {
        {"program", "program"}, {"PRGORAM", "program"}, {"progam", "program"}, {"prog", nullptr},
        {"verfiy", "verify"},   {"erify", "verify"},    {"xyz", nullptr},      {"er", nullptr},
        {"", nullptr},          {nullptr, nullptr},     {"erasse", "erase"},
    };
    const std::vector<HkString> words{"program", "verify", "erase", ""};
    for (const Case& row : cases) {
        EXPECT_STREQ(HkCmdArgs::nearest(row.word, words), row.nearest) << (row.word != nullptr ? row.word : "null");
    }
}

}  // namespace
