// Placing, splitting and judging: what the generator makes of its arguments.

#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include <filesystem>

#include "DataPath.h"
#include "HkFile.h"
#include "IF_IMAGEGEN.h"
#include "ProgressInterfaceClass.h"
#include "TessalCmdargs.h"
#include "images/ElfImage.h"
#include "images/Workbench.h"

namespace {

using testing::HasSubstr;

class Generator : public testing::Test {
protected:
    void SetUp() override { DeviceProfile::setDataPath(TEST_DATA_DIR "/prom"); }

    Workbench bench;
};

TEST_F(Generator, DataGoesWhereItIsTold) {
    bench.write("a", "abc");
    bench.write("b", "DE");
    bench.write("c.elf", ElfImage::small().text());
    bench.write("d.MEM", "@1 5859 5A21");
    struct Case {
        const char* arguments;
        const char* content;
    };
    const Case cases[] = {
        {"-size 16 -data @a -data @b", "abcDE"},
        {"-size 16 -data @a -up 5 -data @b -data @a", "abc..DEabc"},
        {"-size 16 -down 4 -data @a -data @b", "EDcba"},
        {"-size 5 -down 4 -data @a -up 0 -data @b", "DEcba"},
        {"-size 16 -up 1 -data @a -data @d.MEM", "!overlaps what is already at 0x1 to 0x3"},
        {"-size 16 -data @b -data @d.MEM -data @b", "DEXYZ!DE"},
        {"-size 16 -data @b -up 3 -data @d.MEM", "DE.XYZ!"},
        {"-size 16 -down 5 -data @d.MEM", "!ZYX"},
        {"-size 0x20 -up 0 -data @c.elf", "\x01\x02\x03\x04............\xAA\xBB"},
        {"-size 0x20 -down 1F -data @c.elf", "\xBB\xAA............\x04\x03\x02\x01"},
        {"-size 1K -offset 4 0 -data @a -data @b", "DE..abc"},
        {"-size 16 -multiboot -offset 5 1 -data @a -data @d.MEM \"\"", "XYZ!abc"},
    };
    for (const Case& c : cases) {
        const bool isDone =
            bench.generate(std::string("-format bin -output p -disableswap -fillValue 2e ") + c.arguments);
        if (isDone) {
            EXPECT_EQ(bench.read("p.bin"), c.content) << c.arguments;
        } else {
            EXPECT_THAT(bench.said(), HasSubstr(c.content + 1)) << c.arguments;
        }
    }
    EXPECT_TRUE(bench.generate("-format bin -output p -size 1M -multiboot -data @a -data @b -data @a"));
    EXPECT_EQ(bench.read("p.bin").size(), 0x20003U);
}

TEST_F(Generator, FullPromsGoOnInTheNextOneWithANumberAndAChecksum) {
    const std::string data = noise(240);
    bench.write("a", data);
    ASSERT_TRUE(bench.generate("-format bin -disableswap -output p.bin -part ZQR1P zqr1p ext -up 20 -data @a"));
    EXPECT_EQ(bench.read("p_0.bin"), data.substr(0, 68));
    EXPECT_EQ(bench.read("p_1.bin"), data.substr(68, 100));
    EXPECT_EQ(bench.read("p_2.bin"), data.substr(168));
    const std::string sums = bench.said();
    for (int i = 0; i < 3; ++i) {
        const std::string content = bench.read("p_" + std::to_string(i) + ".bin");
        unsigned sum = static_cast<unsigned>((i < 2 ? 100 : 77) - content.size()) * 0xFF;
        for (const char ch : content) {
            sum += static_cast<unsigned char>(ch);
        }
        char text[16];
        std::snprintf(text, sizeof text, "0x%08X\n", sum);
        EXPECT_THAT(sums, HasSubstr(text));
    }
    ASSERT_FALSE(bench.generate("-format bin -output p -part zqr1p zqr1x -up 130 -data @a"));
    EXPECT_THAT(bench.said(), HasSubstr("a: the data would take 0x130 to 0x21F, the PROMs end at 0x12B (300 bytes)"));
}

TEST_F(Generator, APromWithoutDataGetsNoFile) {
    bench.write("a", "abc");
    ASSERT_TRUE(bench.generate("-output q -size 16 16 -up 10 -data @a"));
    EXPECT_THAT(bench.said(), HasSubstr("PROM 1 of 2 (16 bytes): no data, no file\n"));
    EXPECT_FALSE(HkFile::exist((bench / "q_0.mcs").c_str()));
    EXPECT_EQ(bench.read("q_1.mcs").substr(16, 9), ":03000000");
}

TEST_F(Generator, WhatCannotBeDoneIsNamedAndLeavesTheOldFile) {
    bench.write("a", "abc");
    bench.write("a.mcs", "old");
    bench.write("empty", "");
    HkFile::mkdir((bench / "d.mcs").c_str(), false);
    struct Case {
        const char* arguments;
        const char* message;
    };
    const Case cases[] = {
        {"-size 16", "no data file is named"},
        {"-data @a", "no PROM is named, expected -part <part>, -size <bytes> or -generic"},
        {"-size 16 -data @absent",
         "absent: does not exist\nNo PROM file is generated: data file absent cannot be used"},
        {"-size 16 -data @empty", "the data files hold no data"},
        {"-size 12Q -data @a",
         "-size needs a number of bytes from 1 to 4G, such as 65536, 0x10000 or 64K, not \"12Q\""},
        {"-size 0 -data @a", "not \"0\""},
        {"-size 4G 1 -data @a", "4294967297 bytes together"},
        {"-part zqr9p -data @a", "unknown part \"zqr9p\"; did you mean zqr1p?"},
        {"-part minus -data @a", "part minus has no usable size in the data files, \"-1\""},
        {"-part nosize -data @a", "part nosize has no usable size in the data files, \"\""},
        {"-size 16 -generic -data @a", "-size and -generic exclude each other"},
        {"-size 16 -up 1 -up 2 -data @a", "no -data stands between two addresses"},
        {"-size 16 -data @a -up 2", "no -data stands behind the address 0x2"},
        {"-size 16 -offset 0 8 -data @a", "1 data file, 2 addresses"},
        {"-size 16 -multiboot -up 0 -data @a", "-up and -down do not go with it"},
        {"-size 16 -format hex -compressed -data @a", "-compressed needs a format with addresses"},
        {"-size 2 -data @a", "a: the data would take 0x0 to 0x2, the PROMs end at 0x1 (2 bytes)"},
        {"-size 16 -down 1 -data @a", "a: 3 bytes do not fit below 0x2, where 2 bytes have room"},
        {"-size 16 -data @a -up 2 -data @a", "a: the data at 0x2 to 0x4 overlaps what is already at 0x0 to 0x2"},
        {"-generic -format bin -data @a -up F0000000 -data @a", "the gap between the data up to 0x2 and that from "},
        {"-size 16 -output d -data @a", "d.mcs: cannot be made or replaced: "},
        {"-size 16 -output no/where -data @a", "no/where.mcs: cannot be made or replaced: "},
        {"-size 16 -output a.mcs -data @a.mcs", "a.mcs is a data file and would be replaced"},
        {"-size 16 -fillValue 100 -data @a", "its arguments do not fit"},
        {"-size 16 -zzz -data @a", "unknown switch \"-zzz\""},
    };
    for (const Case& c : cases) {
        EXPECT_FALSE(bench.generate(c.arguments)) << c.arguments;
        EXPECT_THAT(bench.said(), HasSubstr(c.message)) << c.arguments;
        EXPECT_EQ(bench.read("a.mcs"), "old") << c.arguments;
    }
    const std::filesystem::directory_iterator entries(bench.path());
    EXPECT_EQ(std::distance(begin(entries), end(entries)), 4) << "nothing is left beside";
    EXPECT_EQ(IF_IMAGEGEN(nullptr).makeprom(), 1);
    EXPECT_FALSE(PromUtility::generate(nullptr));
}

TEST_F(Generator, AFailedReplacementBringsTheFirstFilesBack) {
    bench.write("a", noise(40));
    bench.write("p_0.bin", "old");
    HkFile::mkdir((bench / "p_2.bin").c_str(), false);
    EXPECT_FALSE(bench.generate("-output p -format bin -size 16 16 16 -data @a"));
    EXPECT_EQ(bench.read("p_0.bin"), "old");
    EXPECT_FALSE(HkFile::exist((bench / "p_1.bin").c_str()));
    HkFile::rmdir((bench / "p_2.bin").c_str());
    EXPECT_TRUE(bench.generate("-output p -format bin -size 16 16 16 -data @a"));
    EXPECT_EQ(bench.read("p_0.bin").size(), 16U);
    EXPECT_EQ(bench.read("p_2.bin").size(), 8U);
}

TEST_F(Generator, ReportsItsProgressBlockByBlock) {
    static std::vector<std::string> reports;
    ProgressInterfaceClass::setCallbackFunction([](Callback& record) {
        reports.push_back(std::to_string(record.getProgressStatus()) + ' ' + std::to_string(record.getCurrentCount()) +
                          '/' + std::to_string(record.getTotalCount()));
        return true;
    });
    bench.write("a", noise(600000));
    for (const char* const format : {"bin", "hex", "mcs"}) {
        reports.clear();
        EXPECT_TRUE(bench.generate(std::string("-generic -output p -data @a -format ") + format));
        const int steps = ProgressInterfaceClass::getCBData()->getTotalCount();
        EXPECT_GE(steps, 3) << format;
        EXPECT_EQ(reports.size(), static_cast<std::size_t>(steps) + 1) << format;
        EXPECT_EQ(reports.back(), "1 " + std::to_string(steps) + '/' + std::to_string(steps)) << format;
    }
    EXPECT_FALSE(bench.generate("-size 1 1M -output no/where -data @a"));
    EXPECT_EQ(reports.back().substr(0, 4), "1 0/") << "it has failed before all was done";
    ProgressInterfaceClass::setCallbackFunction(nullptr);
}

TEST(GeneratorFormat, IsThatOfTheShippedCommandAndTakesWhatTheOptionRowsMake) {
    DeviceProfile::setDataPath(SHIPPED_DATA_DIR);
    TessalCmdargs::createCommandMap();
    EXPECT_STREQ(TessalCmdargs::findFormatString("generate"), IF_IMAGEGEN::getcmdformat());
    const char* const words[] = {
        "generate", "",    "-active",    "c",  "-path",        "out",      "-output",    "o", "-compressed",
        "-format",  "hex", "-fillValue", "FF", "-disableswap", "-generic", "-multiboot", ""};
    const HkCmdArgs args(17, words, IF_IMAGEGEN::getcmdformat(), nullptr, HkCmdArgs::Quiet);
    EXPECT_EQ(args.iserror(), 0) << (args.errors().empty() ? "" : args.errors()[0].c_str());
}

}  // namespace
