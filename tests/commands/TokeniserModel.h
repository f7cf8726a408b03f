// The tokeniser as a slow machine that looks at one character at a time on a copy of the line, for comparison with the
// real one. `previous` is the character before the place, zero where that was a separator or the line has not begun.
#pragma once

#include <cstring>
#include <optional>
#include <string>
#include <vector>

/// The tokens of the line; nothing when a quotation is left open.
inline std::optional<std::vector<std::string>> splitByModel(std::string line) {
    std::vector<std::string> words;
    if (line[0] == '#') {
        return words;
    }
    std::size_t start = 0;
    std::size_t place = 0;
    char previous = '\0';
    bool quoted = false;
    while (line[place] != '\0') {
        char& ch = line[place];
        if (ch == '"' && !quoted) {
            quoted = true;
            start = ++place;
            continue;
        }
        if (ch == '"') {
            quoted = false;
            ch = ' ';
        }
        if (!quoted && std::strchr("\t\n\r ", ch) != nullptr) {
            ch = '\0';
            const std::string word(line.c_str() + start);
            if (previous != '\0' && !(words.empty() && word.empty())) {
                words.push_back(word);
            }
            start = place + 1;
        }
        previous = ch;
        ++place;
    }
    if (quoted) {
        return std::nullopt;
    }
    if (place != start) {
        words.emplace_back(line.c_str() + start);
    }
    return words;
}
