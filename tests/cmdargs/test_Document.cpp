// Runs every example of docs/argument-format.md.
#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include <fstream>
#include <string>

#include "cmdargs/Dump.h"

namespace {

struct Example {
    int line = 0;
    std::string format;
    std::string command;
    Lines expected;
};

std::vector<Example> readExamples(const char* path) {
    std::vector<Example> examples;
    std::ifstream file(path);
    std::string line;
    std::string format;
    bool inside = false;
    for (int number = 1; std::getline(file, line); ++number) {
        line.erase(line.find_last_not_of(" \r") + 1);
        if (line.rfind("```", 0) == 0) {
            inside = line == "```args";
        } else if (inside && line.rfind("format ", 0) == 0) {
            format = line.substr(7);
        } else if (inside && line.rfind("$ ", 0) == 0) {
            examples.push_back({number, format, line.substr(2), {}});
        } else if (inside) {
            examples.back().expected.push_back(line);
        }
    }
    return examples;
}

TEST(ArgumentFormatDocument, ExamplesGiveWhatTheySay) {
    const std::vector<Example> examples = readExamples(SHIPPED_DATA_DIR "/../docs/argument-format.md");
    ASSERT_GT(examples.size(), 15U);
    for (const Example& example : examples) {
        const Lines words = splitCommand(example.command);
        const HkCmdArgs args(static_cast<int>(words.size()), pointersTo(words).data(), example.format.c_str(), nullptr,
                             HkCmdArgs::Quiet);
        EXPECT_THAT(dump(args, example.format.c_str()), testing::ElementsAreArray(example.expected))
            << "line " << example.line << ": " << example.command;
    }
}

}  // namespace
