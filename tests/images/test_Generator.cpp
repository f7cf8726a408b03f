// The generator: every command of the documents with examples, progress, a failure midway, its argument format.

#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include <regex>
#include <sstream>

#include "Blocks.h"
#include "DataPath.h"
#include "HkFile.h"
#include "IF_IMAGEGEN.h"
#include "ProgressInterfaceClass.h"
#include "TessalCmdargs.h"
#include "images/Workbench.h"

namespace {

/// One block: data files, or directories, and commands on them, each with what it says and the files that it leaves.
class Block {
public:
    void readLine(const std::string& line) {
        if (line.rfind("$ generate ", 0) == 0) {
            runCommand();
            m_command = std::regex_replace(line.substr(11), std::regex("-data "), "-data @");
        } else if (m_command.empty()) {
            makeFile(line);
        } else if (line.rfind("> ", 0) == 0) {
            m_files.emplace_back(line.substr(2), "");
        } else {
            (m_files.empty() ? m_said : m_files.back().second) += line + '\n';
        }
    }

    /// Runs the last command that was read, and forgets it.
    void runCommand() {
        SCOPED_TRACE(m_command);
        const auto before = m_bench.content();
        const bool isDone = m_command.empty() || m_bench.generate(m_command);
        const std::size_t end = m_said.find("...\n");  // the rest of such a text is the host's
        EXPECT_EQ(m_bench.said().substr(0, end), m_said.substr(0, end));
        EXPECT_TRUE(isDone || m_bench.content() == before) << "refused, but the files are others";
        for (const auto& [name, expected] : m_files) {
            const std::string file = m_bench.read(name);
            const bool isText = !file.empty() && file.back() == '\n';
            EXPECT_EQ(file + (isText ? "" : "\n"), expected) << name;
        }
        m_said.clear();
        m_files.clear();
    }

private:
    /// From "a = 1F 2E", "a "text"" or "a/".
    void makeFile(const std::string& line) {
        std::smatch parts;
        std::regex_match(line, parts, std::regex("(\\S+)(?: = (.*)| \"(.*)\")?"));
        const std::string name = parts[1];
        std::string bytes = parts[3];
        std::istringstream digits(parts[2]);
        for (unsigned byte = 0; digits >> std::hex >> byte;) {
            bytes += static_cast<char>(byte);
        }
        name.back() == '/' ? m_bench.make(name) : m_bench.write(name, bytes);
    }

    Workbench m_bench;
    std::string m_command;
    std::string m_said;
    std::vector<std::pair<std::string, std::string>> m_files;
};

void runDocument(const char* path, std::size_t count) {
    DeviceProfile::setDataPath(TEST_DATA_DIR "/prom");
    const auto blocks = blocksOf(path, "prom");
    EXPECT_EQ(blocks.size(), count) << path;
    for (const std::vector<std::string>& lines : blocks) {
        Block block;
        for (const std::string& line : lines) {
            block.readLine(line);
        }
        block.runCommand();
    }
}

TEST(Documents, AreTrue) {
    runDocument(SHIPPED_DATA_DIR "/../docs/prom-files.md", 2);
    runDocument(TEST_DATA_DIR "/images/cases.md", 6);
}

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

TEST_F(Generator, HasTheFormatOfTheShippedCommand) {
    DeviceProfile::setDataPath(SHIPPED_DATA_DIR);
    TessalCmdargs::createCommandMap();
    EXPECT_STREQ(TessalCmdargs::findFormatString("generate"), IF_IMAGEGEN::getcmdformat());
}

}  // namespace
