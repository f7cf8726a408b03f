#include "HkFile.h"

#include <string>

#include "HkPath.h"
#include "platform/FileSystem.h"

namespace HostKit {
namespace {

bool isNamed(const char* path) {
    return path != nullptr && *path != '\0';
}

/// Makes the directories above the path that are missing; whether it worked shows when the last one is made.
void makeParents(const char* path) {
    std::string parent;
    for (; *path != '\0'; ++path) {
        if (HkPath::IsSeparator(*path) && !parent.empty()) {
            platform::makeDirectory(parent.c_str());
        }
        parent += *path;
    }
}

}  // namespace

bool HkFile::exist(const char* path) {
    return isNamed(path) && platform::exists(path);
}

bool HkFile::isdir(const char* path) {
    return isNamed(path) && platform::isDirectory(path);
}

bool HkFile::mkdir(const char* path, bool parents) {
    if (!isNamed(path)) {
        return false;
    }
    if (platform::makeDirectory(path)) {
        return true;
    }
    if (!parents) {
        return false;
    }
    makeParents(path);
    return platform::makeDirectory(path) || platform::isDirectory(path);
}

bool HkFile::rmdir(const char* path) {
    return isNamed(path) && platform::removeDirectory(path);
}

bool HkFile::rmtree(const char* path) {
    return isNamed(path) && platform::removeTree(path);
}

bool HkFile::remove_f(const char* path) {
    return isNamed(path) && platform::removeFile(path);
}

bool HkFile::copy(const char* source, const char* destination) {
    return isNamed(source) && isNamed(destination) && platform::copyFile(source, destination);
}

HkString HkFile::getcwd() {
    return HkString(platform::currentDirectory().c_str());
}

std::int64_t HkFile::getsize_noopen(const char* path) {
    return isNamed(path) ? platform::fileSize(path) : 0;
}

std::FILE* HkFile::open(const char* path, const char* mode) {
    return isNamed(path) && mode != nullptr ? platform::openFile(path, mode) : nullptr;
}

HkStream& HkFile::getCout() {
    return HkStream::console();
}

}  // namespace HostKit
