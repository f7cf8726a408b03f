// Paths of any form against the rules of their front, followed from one separator to the next.
#include <algorithm>
#include <optional>
#include <string>

#include "FileUtility.h"
#include "HkFile.h"
#include "fuzz/Fuzz.h"

namespace {

bool isSeparator(char ch) {
    return ch == '/' || ch == '\\';
}

/// The root without its last levels, each of which begins with a separator.
std::string above(const std::string& root, std::size_t levels) {
    std::size_t end = root.size();
    for (std::size_t at = root.size(); levels > 0 && at-- > 0;) {
        if (isSeparator(root[at]) && --levels == 0) {
            end = at;
        }
    }
    return root.substr(0, end);
}

/// The expected result, or nothing for an illegal path.
std::optional<std::string> convertBySteps(const std::string& path, const std::string& root) {
    std::size_t levels = 0;
    for (std::size_t at = 0;;) {
        const std::size_t end = std::min(path.find_first_not_of('.', at), path.size());
        const std::size_t dots = end - at;
        const bool isStep = end < path.size() && isSeparator(path[end]);
        if (dots > 2 || (dots > 0 && !isStep && end < path.size())) {
            return std::nullopt;
        }
        if (!isStep) {
            return above(root, levels) + "/" + path.substr(end);
        }
        levels += dots == 2 ? 1 : 0;
        at = end + 1;
    }
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
