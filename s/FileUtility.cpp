#include "FileUtility.h"

#include <algorithm>
#include <cstring>
#include <string>
#include <string_view>

#include "HkFile.h"
#include "HkPath.h"
#include "HkStr.h"
#include "UnitOrigin.h"

namespace {

constexpr UnitOrigin origin{"../s/FileUtility", "$Revision: 1.1 $"};
constexpr std::string_view separators = "/\\";

/// The text before the last of these characters, all of it when there is none.
std::string_view beforeLast(std::string_view text, std::string_view characters) {
    return text.substr(0, text.find_last_of(characters));
}

std::string joined(std::string_view directory, std::string_view name) {
    return std::string(directory).append("/").append(name);
}

bool isAbsolute(std::string_view path) {
    return (!path.empty() && HkPath::IsSeparator(path.front())) || path.find(':') != std::string_view::npos;
}

bool startsWithParent(std::string_view path) {
    return path.size() > 2 && path.substr(0, 2) == ".." && HkPath::IsSeparator(path[2]);
}

/// What the dots and separators at the front of a path say.
struct Front {
    bool isLegal;
    std::size_t levels;  ///< how many directories to climb
    std::string_view tail;
};

Front scanFront(std::string_view path) {
    std::size_t levels = 0;
    for (;;) {
        path.remove_prefix(std::min(path.find_first_not_of(separators), path.size()));
        const std::size_t dots = std::min(path.find_first_not_of('.'), path.size());
        if (dots == 0) {
            return {true, levels, path};
        }
        const bool isLast = dots == path.size();
        if (dots > 2 || (!isLast && !HkPath::IsSeparator(path[dots]))) {
            return {false, 0, {}};
        }
        if (dots == 2 && !isLast) {
            ++levels;
        }
        path.remove_prefix(dots);
    }
}

/// The root without its last @p levels directories, or all of it when it has fewer separators than that.
std::string_view climbed(std::string_view root, std::size_t levels) {
    std::string_view rest = root;
    for (; levels > 0; --levels) {
        const std::size_t separator = rest.find_last_of(separators);
        if (separator == std::string_view::npos) {
            return root;
        }
        rest = rest.substr(0, separator);
    }
    return rest;
}

}  // namespace

HkString FileUtility::getTail(const char* path) {
    const std::string_view text = HkStr::View(path);
    return HkString(text.substr(text.find_last_of(separators) + 1));  // npos + 1 is 0
}

HkString FileUtility::getHead(const char* path) {
    return HkString(beforeLast(HkStr::View(path), separators));
}

HkString FileUtility::getBase(const char* path) {
    return HkString(beforeLast(HkStr::View(path), "."));
}

bool FileUtility::isObjectFile(const char* path) {
    const char* const extension = HkPath::GetExt(path, nullptr);
    return HkStr::ICompare(extension, "elf") == 0 || HkStr::ICompare(extension, "mem") == 0;
}

bool FileUtility::rmdir(const char* path) {
    HkFile::rmtree(path);
    return true;
}

bool FileUtility::copyFile(const char* fromDir, const char* toDir, const char* name) {
    const std::string_view directory = HkStr::View(toDir);
    if (!HkFile::exist(toDir) && !HkFile::mkdir(toDir, true)) {
        origin.report().issueInfo("Failed to make destination directory %s.\n", directory.data());
        return false;
    }
    const std::string source = joined(HkStr::View(fromDir), HkStr::View(name));
    const std::string destination = joined(directory, HkStr::View(name));
    const bool isCopied = HkFile::copy(source.c_str(), destination.c_str());
    if (!isCopied) {
        origin.report().issueInfo("Failed to copy file from %s to %s.\n", source.c_str(), destination.c_str());
    }
    return isCopied;
}

HkString FileUtility::convertPath(HkString path, HkString base) {
    const std::string_view text = HkStr::View(path);
    if (isAbsolute(text)) {
        return path;
    }
    const Front front = scanFront(text);
    if (!front.isLegal) {
        origin.report().issueInfo("Illegal input path %s\n", path.c_str());
        return path;
    }
    const HkString root = startsWithParent(text) || base.IsEmpty() ? HkFile::getcwd() : base;
    HkString result(joined(climbed(HkStr::View(root), front.levels), front.tail));
    if (!HkFile::exist(result)) {
        origin.report().issueInfo("Path does not exist. Please check the path parameters %s, %s\n", path.c_str(),
                                  base.c_str());
    }
    return result;
}
