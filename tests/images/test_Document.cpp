// Runs every command of the documents with examples.

#include <gtest/gtest.h>

#include <filesystem>
#include <fstream>
#include <map>
#include <regex>

#include "DataPath.h"
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

/// "a = 1F 2E", "a "text"" or "a/".
std::pair<std::string, std::string> readFile(const std::string& line) {
    std::smatch parts;
    std::regex_match(line, parts, std::regex("(\\S+)(?: = (.*)| \"(.*)\")?"));
    std::string content = parts[3];
    const std::string digits = parts[2];
    for (std::size_t at = 0; at < digits.size(); at += digits[at] == ' ' ? 1 : 2) {
        content +=
            digits[at] == ' ' ? "" : std::string(1, static_cast<char>(std::stoi(digits.substr(at, 2), nullptr, 16)));
    }
    return {parts[1], content};
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
    const bool isDone = bench.generate(std::regex_replace(step.command, std::regex("-data "), "-data @"));
    // The rest of a text that ends in "..." is the host's.
    const std::size_t told = std::min(step.said.size(), step.said.find("...\n"));
    EXPECT_EQ(bench.said().substr(0, told), step.said.substr(0, told)) << step.command;
    EXPECT_TRUE(told < step.said.size() || bench.said().size() == told) << step.command << ": " << bench.said();
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
            name.back() == '/' ? bench.make(name) : bench.write(name, content);
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
