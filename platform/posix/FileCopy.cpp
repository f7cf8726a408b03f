// Copying a file so that its destination is the old file or the whole new one at any time.
#include <fcntl.h>
#include <sys/stat.h>
#include <unistd.h>

#include <memory>
#include <string>

#include "platform/FileSystem.h"
#include "platform/posix/Descriptor.h"
#include "platform/posix/NativePath.h"
#include "platform/posix/Replacement.h"

namespace platform {
namespace {

constexpr mode_t accessRights = 0777;

bool transfer(const Descriptor& source, Replacement& copy) {
    constexpr std::size_t chunk = std::size_t{128} * 1024;
    const std::unique_ptr<char[]> buffer(new char[chunk]);
    for (;;) {
        const ssize_t got = uninterrupted([&] { return ::read(source.get(), buffer.get(), chunk); });
        if (got <= 0) {
            return got == 0;
        }
        if (!copy.write(buffer.get(), static_cast<std::size_t>(got))) {
            return false;
        }
    }
}

}  // namespace

bool copyFile(const char* source, const char* destination) {
    const Descriptor from(uninterrupted(
        [&] { return ::open(nativePath(source).c_str(), O_RDONLY | O_CLOEXEC | O_NONBLOCK | O_NOCTTY); }));
    struct stat original {};
    if (!from.isOpen() || ::fstat(from.get(), &original) != 0 || !S_ISREG(original.st_mode)) {
        return false;
    }
    const std::string target = linkResolved(nativePath(destination));
    struct stat former {};
    const bool replaces = ::stat(target.c_str(), &former) == 0;
    const bool isSame = replaces && former.st_dev == original.st_dev && former.st_ino == original.st_ino;
    if (isSame || (replaces && (!S_ISREG(former.st_mode) || ::access(target.c_str(), W_OK) != 0))) {
        return false;
    }
    Replacement copy(target, original.st_mode & accessRights);
    return copy.isOpen() && (!replaces || copy.setRights(former.st_mode & accessRights)) && transfer(from, copy) &&
           copy.store() && copy.close() && copy.putInPlace();
}

}  // namespace platform
