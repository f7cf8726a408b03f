// Runs every command of the documents with examples.

#include <gtest/gtest.h>

#include <algorithm>
#include <fstream>
#include <optional>
#include <regex>

#include "DataPath.h"
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
        std::string digits = parts[2];
        digits.erase(std::remove(digits.begin(), digits.end(), ' '), digits.end());
        std::string bytes = parts[3];
        for (std::size_t at = 0; at < digits.size(); at += 2) {
            bytes += static_cast<char>(std::stoi(digits.substr(at, 2), nullptr, 16));
        }
        name.back() == '/' ? m_bench.make(name) : m_bench.write(name, bytes);
    }

    Workbench m_bench;
    std::string m_command;
    std::string m_said;
    std::vector<std::pair<std::string, std::string>> m_files;
};

void runDocument(const char* path, int blocks) {
    DeviceProfile::setDataPath(TEST_DATA_DIR "/prom");
    std::ifstream document(path);
    std::optional<Block> block;
    int count = 0;
    for (std::string line; std::getline(document, line);) {
        if (line == "```prom") {
            block.emplace();
            ++count;
        } else if (block && line == "```") {
            block->runCommand();
            block.reset();
        } else if (block) {
            block->readLine(line);
        }
    }
    EXPECT_EQ(count, blocks);
}

TEST(Documents, TheGuideIsTrue) {
    runDocument(SHIPPED_DATA_DIR "/../docs/prom-files.md", 2);
}

TEST(Documents, TheCasesAreTrue) {
    runDocument(TEST_DATA_DIR "/images/cases.md", 6);
}

}  // namespace
