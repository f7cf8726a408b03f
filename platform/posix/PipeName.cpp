#include "platform/posix/PipeName.h"

#include <sys/stat.h>
#include <sys/un.h>
#include <unistd.h>

#include <cerrno>
#include <cstdlib>
#include <string_view>

namespace platform {
namespace {

constexpr std::string_view windowsForm = "\\\\.\\pipe\\";

/// A directory of the user's own that nobody else may use.
bool isPrivate(const std::string& directory) {
    struct stat status {};
    if (::lstat(directory.c_str(), &status) != 0) {
        return false;
    }
    if (!S_ISDIR(status.st_mode) || status.st_uid != ::geteuid() || (status.st_mode & 077) != 0) {
        errno = EACCES;
        return false;
    }
    return true;
}

/// The session's runtime directory or, without one, a directory of the user's in the temporary one; empty, with errno
/// set, where neither can be had.
std::string runtimeDirectory() {
    const char* const given = std::getenv("XDG_RUNTIME_DIR");
    if (given != nullptr && given[0] == '/' && isPrivate(given)) {
        return given;
    }
    const std::string own = "/tmp/tessal-" + std::to_string(::geteuid());
    if (::mkdir(own.c_str(), 0700) != 0 && errno != EEXIST) {
        return {};
    }
    return isPrivate(own) ? own : std::string();
}

std::string refused(int error) {
    errno = error;
    return {};
}

}  // namespace

std::string pipePath(const char* name) {
    std::string path = name != nullptr ? name : "";
    if (path.compare(0, windowsForm.size(), windowsForm) == 0) {
        const std::string bare = path.substr(windowsForm.size());
        if (bare.empty() || bare.find('/') != std::string::npos) {
            return refused(ENOENT);
        }
        const std::string directory = runtimeDirectory();
        if (directory.empty()) {
            return {};
        }
        path = directory + '/' + bare;
    }
    if (path.empty()) {
        return refused(ENOENT);
    }
    // Beside the socket lies its lock and, for a moment, its unfinished form, whose names are the longest.
    constexpr std::size_t suffix = sizeof ".lock" - 1;
    return path.size() + suffix < sizeof(sockaddr_un{}.sun_path) ? path : refused(ENAMETOOLONG);
}

}  // namespace platform
