// Paths of any form against the state table of the front, walked character by character.
#include <optional>
#include <string>

#include "FileUtility.h"
#include "HkFile.h"
#include "fuzz/Fuzz.h"

namespace {

bool isSeparator(char ch) {
    return ch == '/' || ch == '\\';
}

enum class State { Start, OneDot, TwoDots };

/// The expected result, or nothing for an illegal path.
std::optional<std::string> convertBySteps(const std::string& path, const std::string& root) {
    State state = State::Start;
    int levels = 0;
    std::size_t i = 0;
    for (; i < path.size() && !(state == State::Start && path[i] != '.' && !isSeparator(path[i])); ++i) {
        if (path[i] == '.') {
            if (state == State::TwoDots) {
                return std::nullopt;
            }
            state = state == State::Start ? State::OneDot : State::TwoDots;
        } else if (isSeparator(path[i])) {
            levels += state == State::TwoDots ? 1 : 0;
            state = State::Start;
        } else {
            return std::nullopt;
        }
    }
    std::size_t end = root.size();
    for (std::size_t at = root.size(); levels > 0 && at-- > 0;) {
        if (isSeparator(root[at]) && --levels == 0) {
            end = at;
        }
    }
    return root.substr(0, end) + "/" + path.substr(i);
}

}  // namespace

/// The input is a path and, behind its first line end, a base.
void fuzz(Input input) {
    const std::string path = input.line();
    const std::string base = input.text();
    const bool isAbsolute = (!path.empty() && isSeparator(path[0])) || path.find(':') != std::string::npos;
    const bool isAbove = path.rfind("../", 0) == 0 || path.rfind("..\\", 0) == 0;
    const std::string root = isAbove || base.empty() ? HkFile::getcwd().c_str() : base;
    const std::string expected = isAbsolute ? path : convertBySteps(path, root).value_or(path);
    require(expected == FileUtility::convertPath(path.c_str(), base.c_str()).c_str());
}
