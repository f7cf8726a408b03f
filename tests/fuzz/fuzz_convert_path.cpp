// Paths of any form against a plain model, which takes one element after the other off the front.
#include <optional>
#include <string>

#include "FileUtility.h"
#include "HkFile.h"
#include "fuzz/Fuzz.h"

namespace {

constexpr const char* separators = "/\\";

/// The directory so many levels above; the root itself where there are not so many.
std::string above(const std::string& root, int levels) {
    std::string result = root;
    for (; levels > 0; --levels) {
        const std::size_t end = result.find_last_of(separators);
        if (end == std::string::npos) {
            return root;
        }
        result.erase(end);
    }
    return result;
}

/// The expected result, or nothing for an illegal path.
std::optional<std::string> convertByElements(std::string path, const std::string& root) {
    int levels = 0;
    std::size_t end = path.find_first_of(separators);
    for (; end == path.find_first_not_of('.') && end <= 2; end = path.find_first_of(separators)) {
        levels += end == 2 ? 1 : 0;
        path.erase(0, end + 1);
    }
    if (path == "." || path == "..") {
        path.clear();
    }
    return path[0] != '.' ? std::optional(above(root, levels) + "/" + path) : std::nullopt;
}

}  // namespace

/// The input is a path and, behind its first line end, a base.
void fuzz(Input input) {
    const std::string path = input.line();
    const std::string base = input.text();
    const bool isAbsolute = path.find_first_of(separators) == 0 || path.find(':') != std::string::npos;
    const bool isAbove = path.find_first_of(separators) == 2 && path.rfind("..", 0) == 0;
    const std::string root = isAbove || base.empty() ? HkFile::getcwd().c_str() : base;
    const std::string expected = isAbsolute ? path : convertByElements(path, root).value_or(path);
    require(expected == FileUtility::convertPath(path.c_str(), base.c_str()).c_str());
}
