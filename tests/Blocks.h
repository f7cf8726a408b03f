// The blocks of code in a document, which tests hold against what the library does.
#pragma once

#include <fstream>
#include <string>
#include <vector>

/// The lines of each block of that language, without blanks at their ends.
inline std::vector<std::vector<std::string>> blocksOf(const char* path, const std::string& language) {
    std::ifstream document(path);
    std::vector<std::vector<std::string>> blocks;
    bool inside = false;
    for (std::string line; std::getline(document, line);) {
        line.erase(line.find_last_not_of(" \r") + 1);
        if (line.rfind("```", 0) == 0) {
            inside = line == "```" + language;
            blocks.resize(blocks.size() + (inside ? 1 : 0));
        } else if (inside) {
            blocks.back().push_back(line);
        }
    }
    return blocks;
}
