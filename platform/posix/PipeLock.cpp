#include "platform/posix/PipeLock.h"

#include <fcntl.h>
#include <pthread.h>
#include <sys/stat.h>
#include <unistd.h>

#include <cerrno>
#include <map>
#include <mutex>

#include "platform/posix/Descriptor.h"

namespace platform {
namespace {

struct Held {
    std::string path;
    Descriptor lock;
};

/// The server ends of this process, by descriptor.
struct Registry {
    std::mutex mutex;
    std::map<int, Held> ends;
};

Registry& registry();

// A fork happens between two changes of the registry, and the child's copy is emptied: closing the descriptors there
// leaves the parent's locks alone, as they belong to the description that the parent still has.
void beforeFork() {
    registry().mutex.lock();
}
void inParent() {
    registry().mutex.unlock();
}
void inChild() {
    registry().ends.clear();
    registry().mutex.unlock();
}

Registry& registry() {
    static Registry& instance = []() -> Registry& {
        ::pthread_atfork(beforeFork, inParent, inChild);
        return *new Registry;
    }();
    return instance;
}

std::string lockPath(const std::string& path) {
    return path + ".lock";
}

flock wholeFile(short type) {
    flock range{};
    range.l_type = type;
    range.l_whence = SEEK_SET;
    return range;
}

/// True when the path still leads to the open file: it may have been removed between opening and locking.
bool isSameFile(const Descriptor& file, const std::string& path) {
    struct stat opened {};
    struct stat named {};
    return ::fstat(file.get(), &opened) == 0 && ::lstat(path.c_str(), &named) == 0 && opened.st_ino == named.st_ino &&
           opened.st_dev == named.st_dev;
}

/// The locked file; a closed descriptor, with errno set, where another server holds it.
Descriptor lockFile(const std::string& path) {
    for (;;) {
        Descriptor file(::open(path.c_str(), O_RDWR | O_CREAT | O_CLOEXEC | O_NOFOLLOW, 0600));
        flock range = wholeFile(F_WRLCK);
        if (!file.isOpen()) {
            return file;
        }
        if (::fcntl(file.get(), F_OFD_SETLK, &range) != 0) {
            errno = EADDRINUSE;
            return {};
        }
        if (isSameFile(file, path)) {
            return file;
        }
    }
}

}  // namespace

bool holdPipeLock(int serverEnd, const std::string& path) {
    Registry& held = registry();
    const std::lock_guard<std::mutex> guard(held.mutex);
    Descriptor lock = lockFile(lockPath(path));
    if (!lock.isOpen()) {
        return false;
    }
    held.ends[serverEnd] = Held{path, std::move(lock)};
    return true;
}

void dropPipeLock(int serverEnd) {
    Registry& held = registry();
    const std::lock_guard<std::mutex> guard(held.mutex);
    const auto end = held.ends.find(serverEnd);
    if (end != held.ends.end()) {
        ::unlink(end->second.path.c_str());
        ::unlink(lockPath(end->second.path).c_str());
        held.ends.erase(end);
    }
}

bool isPipeLocked(const std::string& path) {
    const Descriptor file(::open(lockPath(path).c_str(), O_RDWR | O_CLOEXEC | O_NOFOLLOW));
    flock range = wholeFile(F_WRLCK);
    return file.isOpen() && ::fcntl(file.get(), F_OFD_GETLK, &range) == 0 && range.l_type != F_UNLCK;
}

}  // namespace platform
