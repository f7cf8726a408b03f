#include "Quoting.h"

#include <algorithm>
#include <cstdio>

namespace {

constexpr std::size_t longest = 200;

bool isControl(char ch) {
    return static_cast<unsigned char>(ch) < ' ' || ch == 0x7F;
}

bool isPlain(std::string_view word) {
    const auto needsQuotes = [](char ch) { return ch == ' ' || isControl(ch); };
    return !word.empty() && word.size() <= longest && std::none_of(word.begin(), word.end(), needsQuotes);
}

}  // namespace

std::string quoted(std::string_view word) {
    std::string text = "\"";
    for (const char ch : word.substr(0, longest)) {
        if (isControl(ch)) {
            char code[8];
            std::snprintf(code, sizeof code, "\\x%02X", static_cast<unsigned>(static_cast<unsigned char>(ch)));
            text += code;
        } else {
            text += ch;
        }
    }
    return text + (word.size() > longest ? "...\"" : "\"");
}

std::string quotedWhereNeeded(std::string_view word) {
    return isPlain(word) ? std::string(word) : quoted(word);
}
