// Runs every command of the documents with examples.

#include <gtest/gtest.h>

#include <filesystem>
#include <fstream>
#include <map>

#include "DataPath.h"
#include "HkFile.h"
#include "images/Workbench.h"

namespace {

using Files = std::vector<std::pair<std::string, std::string>>;

/// A command with what it says and leaves.
struct Step {
    std::string command;
    std::string said;
    Files files;
};

/// One block: data files, or directories, and commands.
struct Block {
    Files files;
    std::vector<Step> steps;
};

/// "a = 1F", "a "text"" or "a/".
std::pair<std::string, std::string> readFile(const std::string& line) {
    const std::size_t quote = line.find(" \"");
    if (quote != std::string::npos) {
        return {line.substr(0, quote), line.substr(quote + 2, line.size() - quote - 3)};
    }
    const std::size_t sign = line.find(" = ");
    return {line.substr(0, sign), sign != std::string::npos ? bytes(line.substr(sign + 3)) : ""};
}

void readLine(const std::string& line, Block& block) {
    if (line.rfind("$ generate ", 0) == 0) {
        block.steps.push_back({line.substr(11), {}, {}});
    } else if (block.steps.empty()) {
        block.files.push_back(readFile(line));
    } else if (Step& step = block.steps.back(); line.rfind("> ", 0) == 0) {
        step.files.emplace_back(line.substr(2), "");
    } else {
        (step.files.empty() ? step.said : step.files.back().second) += line + '\n';
    }
}

std::vector<Block> readBlocks(const char* path) {
    std::vector<Block> blocks;
    std::ifstream document(path);
    bool isInside = false;
    for (std::string line; std::getline(document, line);) {
        if (line.rfind("```", 0) == 0) {
            isInside = line == "```prom";
            blocks.resize(blocks.size() + (isInside ? 1 : 0));
        } else if (isInside) {
            readLine(line, blocks.back());
        }
    }
    return blocks;
}

/// The data files of a document stand in the directory of the run.
std::string placed(std::string command) {
    const std::string before = " -data ";
    for (std::size_t at = 0; (at = (' ' + command).find(before, at)) != std::string::npos; at += before.size()) {
        command.insert(at + before.size() - 1, "@");
    }
    return command;
}

/// What is said, as far as the document tells it: the rest of a text that ends in "..." is the host's.
std::string toldPart(const std::string& said, const std::string& expected) {
    const std::size_t open = expected.rfind("...\n");
    const bool isOpen = open != std::string::npos && open + 4 == expected.size();
    return isOpen && said.size() > open ? said.substr(0, open) + "...\n" : said;
}

std::map<std::string, std::string> contentOf(const Workbench& bench) {
    std::map<std::string, std::string> files;
    for (const auto& entry : std::filesystem::directory_iterator(bench.path())) {
        const std::string name = entry.path().filename().string();
        files[name] = entry.is_directory() ? "directory" : bench.read(name);
    }
    return files;
}

void run(const Step& step, Workbench& bench) {
    const auto before = contentOf(bench);
    const bool isDone = bench.generate(placed(step.command));
    EXPECT_EQ(toldPart(bench.said(), step.said), step.said) << step.command;
    EXPECT_TRUE(isDone || contentOf(bench) == before) << "refused, but the files are others: " << step.command;
    for (const auto& [name, expected] : step.files) {
        const std::string content = bench.read(name);
        const bool isText = !content.empty() && content.back() == '\n';
        EXPECT_EQ(content + (isText ? "" : "\n"), expected) << step.command;
    }
}

void runDocument(const char* path, std::size_t blocks) {
    DeviceProfile::setDataPath(TEST_DATA_DIR "/prom");
    const std::vector<Block> document = readBlocks(path);
    ASSERT_EQ(document.size(), blocks);
    for (const Block& block : document) {
        Workbench bench;
        for (const auto& [name, content] : block.files) {
            if (name.back() == '/') {
                HkFile::mkdir((bench / name).c_str(), false);
            } else {
                bench.write(name, content);
            }
        }
        for (const Step& step : block.steps) {
            run(step, bench);
        }
    }
}

TEST(Documents, TheGuideIsTrue) {
    runDocument(SHIPPED_DATA_DIR "/../docs/prom-files.md", 2);
}

TEST(Documents, TheCasesAreTrue) {
    runDocument(TEST_DATA_DIR "/images/cases.md", 6);
}

}  // namespace
