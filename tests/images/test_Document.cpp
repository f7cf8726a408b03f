// Runs every command of docs/prom-files.md.

#include <gtest/gtest.h>

#include <fstream>

#include "images/Workbench.h"

namespace {

struct Step {
    std::string command;
    std::string said;
    std::string file;
    std::string content;
};

/// One block: data files, and commands with what they report and leave.
struct Block {
    std::vector<std::pair<std::string, std::string>> files;
    std::vector<Step> steps;
};

std::vector<Block> readBlocks(const char* path) {
    std::vector<Block> blocks;
    std::ifstream document(path);
    bool isInside = false;
    for (std::string line; std::getline(document, line);) {
        if (line.rfind("```", 0) == 0) {
            isInside = line == "```prom";
            if (isInside) {
                blocks.emplace_back();
            }
        } else if (isInside && line.rfind("$ generate ", 0) == 0) {
            blocks.back().steps.push_back({line.substr(11), {}, {}, {}});
        } else if (isInside && blocks.back().steps.empty()) {
            const std::size_t sign = line.find(" = ");
            blocks.back().files.emplace_back(line.substr(0, sign), bytes(line.substr(sign + 3)));
        } else if (isInside) {
            Step& step = blocks.back().steps.back();
            if (line.rfind("> ", 0) == 0) {
                step.file = line.substr(2);
            } else {
                (step.file.empty() ? step.said : step.content) += line + '\n';
            }
        }
    }
    return blocks;
}

/// The data files of a document stand in the directory of the run.
std::string placed(const std::string& command) {
    std::string result;
    for (std::size_t at = 0; at < command.size(); ++at) {
        result += command[at];
        if (result.size() > 6 && result.substr(result.size() - 6) == "-data ") {
            result += '@';
        }
    }
    return result;
}

TEST(PromFilesDocument, CommandsDoWhatItSays) {
    const std::vector<Block> blocks = readBlocks(SHIPPED_DATA_DIR "/../docs/prom-files.md");
    ASSERT_EQ(blocks.size(), 2U);
    for (const Block& block : blocks) {
        Workbench bench;
        for (const auto& [name, content] : block.files) {
            bench.write(name, content);
        }
        for (const Step& step : block.steps) {
            bench.generate(placed(step.command));
            EXPECT_EQ(bench.said(), step.said) << step.command;
            if (!step.file.empty()) {
                const std::string content = bench.read(step.file);
                const bool isText = content.back() == '\n';
                EXPECT_EQ(content + (isText ? "" : "\n"), step.content) << step.command;
            }
        }
    }
}

}  // namespace
