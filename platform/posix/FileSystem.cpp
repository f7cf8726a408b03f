#include "platform/FileSystem.h"

#include <dirent.h>
#include <sys/stat.h>
#include <unistd.h>

#include <algorithm>
#include <cerrno>
#include <cstdlib>
#include <cstring>
#include <memory>

#include "platform/posix/NativePath.h"

namespace platform {
namespace {

constexpr mode_t everyone = 0777;  // less what the process's mask takes away

/// The mode of what is at the path, 0 when there is nothing.
mode_t modeOf(const char* path) {
    struct stat status {};
    return ::stat(nativePath(path).c_str(), &status) == 0 ? status.st_mode : 0;
}

bool isSelfOrParent(const char* name) {
    return std::strcmp(name, ".") == 0 || std::strcmp(name, "..") == 0;
}

}  // namespace

std::string nativePath(const char* path) {
    std::string native(path);
    std::replace(native.begin(), native.end(), '\\', '/');
    while (native.size() > 1 && native.back() == '/') {
        native.pop_back();
    }
    return native;
}

bool exists(const char* path) {
    return modeOf(path) != 0;
}

bool isDirectory(const char* path) {
    return S_ISDIR(modeOf(path));
}

std::int64_t fileSize(const char* path) {
    struct stat status {};
    return ::stat(nativePath(path).c_str(), &status) == 0 && S_ISREG(status.st_mode) ? status.st_size : 0;
}

bool makeDirectory(const char* path) {
    return ::mkdir(nativePath(path).c_str(), everyone) == 0;
}

bool removeDirectory(const char* path) {
    return ::rmdir(nativePath(path).c_str()) == 0;
}

bool removeFile(const char* path) {
    return ::unlink(nativePath(path).c_str()) == 0;
}

std::vector<std::string> listDirectory(const char* path, bool hiddenToo) {
    std::vector<std::string> names;
    const std::unique_ptr<DIR, int (*)(DIR*)> directory(::opendir(nativePath(path).c_str()), &::closedir);
    while (const dirent* const entry = directory != nullptr ? ::readdir(directory.get()) : nullptr) {
        if (!isSelfOrParent(entry->d_name) && (hiddenToo || entry->d_name[0] != '.')) {
            names.emplace_back(entry->d_name);
        }
    }
    return names;
}

std::string currentDirectory() {
    std::string text(256, '\0');
    while (::getcwd(text.data(), text.size()) == nullptr) {
        if (errno != ERANGE) {
            return {};
        }
        text.resize(text.size() * 2);
    }
    text.resize(std::strlen(text.c_str()));
    return text;
}

std::FILE* openFile(const char* path, const char* mode) {
    return std::fopen(nativePath(path).c_str(), mode);
}

}  // namespace platform
