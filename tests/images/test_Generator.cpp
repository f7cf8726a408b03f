// The generator beside its examples: progress, a failure midway, its argument format.

#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include "DataPath.h"
#include "HkFile.h"
#include "IF_IMAGEGEN.h"
#include "ProgressInterfaceClass.h"
#include "TessalCmdargs.h"
#include "images/Workbench.h"

namespace {

std::vector<std::string> reports;
std::string lastFile;

class Generator : public testing::Test {
protected:
    ~Generator() override { ProgressInterfaceClass::setCallbackFunction(nullptr); }
};

TEST_F(Generator, ReportsItsProgressBlockByBlock) {
    ProgressInterfaceClass::setCallbackFunction([](Callback& record) {
        reports.push_back(std::to_string(record.getProgressStatus()) + ' ' + std::to_string(record.getCurrentCount()) +
                          '/' + std::to_string(record.getTotalCount()));
        return true;
    });
    Workbench bench;
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
}

/// The last file is opened and written before a directory takes its place, so only its renaming fails.
TEST_F(Generator, AReplacementThatFailsMidwayBringsTheFirstFilesBack) {
    Workbench bench;
    lastFile = bench / "p_2.bin";
    bench.write("a", noise(900000));
    bench.write("p_0.bin", "old");
    ProgressInterfaceClass::setCallbackFunction(
        [](Callback& record) { return record.getCurrentCount() == 5 && HkFile::mkdir(lastFile.c_str(), false); });
    EXPECT_FALSE(bench.generate("-output p -format bin -size 300000 300000 300000 -data @a"));
    EXPECT_THAT(bench.said(), testing::HasSubstr("p_2.bin: cannot be replaced: "));
    EXPECT_EQ(bench.read("p_0.bin"), "old");
    HkFile::rmdir(lastFile.c_str());
    EXPECT_EQ(bench.content().size(), 2U) << "no new file and nothing beside";
}

TEST_F(Generator, WithoutACommandThereIsNothingToDo) {
    EXPECT_EQ(IF_IMAGEGEN(nullptr).makeprom(), 1);
    EXPECT_FALSE(PromUtility::generate(nullptr));
}

TEST_F(Generator, HasTheFormatOfTheShippedCommandAndTakesWhatTheOptionRowsMake) {
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
