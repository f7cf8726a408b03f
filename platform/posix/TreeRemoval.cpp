// Removal of a directory tree that nobody can lead astray. Every name is looked up in a directory that is held open,
// and no link is entered, so a directory that is replaced by a link meanwhile costs nothing outside the tree. One
// descriptor is open at a time and the way back is kept in memory, so the depth is limited by neither descriptors nor
// path lengths nor stack; on the way up the parent must be the directory that was left.
#include <dirent.h>
#include <fcntl.h>
#include <sys/stat.h>
#include <unistd.h>

#include <cerrno>
#include <cstring>
#include <memory>
#include <string>
#include <vector>

#include "platform/FileSystem.h"
#include "platform/posix/Descriptor.h"
#include "platform/posix/NativePath.h"

namespace platform {
namespace {

constexpr int directoryOnly = O_RDONLY | O_DIRECTORY | O_CLOEXEC | O_NONBLOCK;

/// A directory between the top of the tree and the one that is being emptied, both included.
struct Level {
    std::string name;
    dev_t device = 0;
    ino_t inode = 0;
    std::vector<std::string> subdirectories;  ///< those not yet entered
};

bool isSame(const Level& level, const struct stat& status) {
    return level.device == status.st_dev && level.inode == status.st_ino;
}

std::vector<std::string> namesIn(const Descriptor& directory) {
    std::vector<std::string> names;
    Descriptor own(::openat(directory.get(), ".", directoryOnly));
    const std::unique_ptr<DIR, int (*)(DIR*)> listing(own.isOpen() ? ::fdopendir(own.get()) : nullptr, &::closedir);
    if (listing == nullptr) {
        return names;
    }
    own.release();  // the listing closes it
    while (const dirent* const entry = ::readdir(listing.get())) {
        if (std::strcmp(entry->d_name, ".") != 0 && std::strcmp(entry->d_name, "..") != 0) {
            names.emplace_back(entry->d_name);
        }
    }
    return names;
}

class TreeRemoval {
public:
    /// Empties the directory as far as that can be done.
    void empty(Descriptor top) {
        if (!enter(std::move(top), {})) {
            return;
        }
        for (;;) {
            std::vector<std::string>& waiting = m_levels.back().subdirectories;
            if (!waiting.empty()) {
                const std::string name = std::move(waiting.back());
                waiting.pop_back();
                descend(name);
            } else if (m_levels.size() == 1 || !ascend()) {
                return;
            }
        }
    }

private:
    /// Makes the directory the one to empty: removes its files and notes its subdirectories.
    bool enter(Descriptor directory, const std::string& name) {
        struct stat status {};
        if (::fstat(directory.get(), &status) != 0) {
            return false;
        }
        Level level{name, status.st_dev, status.st_ino, {}};
        for (std::string& entry : namesIn(directory)) {
            if (::unlinkat(directory.get(), entry.c_str(), 0) != 0 && errno == EISDIR) {
                level.subdirectories.push_back(std::move(entry));
            }
        }
        m_levels.push_back(std::move(level));
        m_here = std::move(directory);
        return true;
    }

    /// Enters a subdirectory, or removes it at once where it cannot be searched: then it is empty or has to stay.
    void descend(const std::string& name) {
        Descriptor directory(::openat(m_here.get(), name.c_str(), directoryOnly | O_NOFOLLOW));
        struct stat wayBack {};
        const bool searchable = directory.isOpen() && ::fstatat(directory.get(), "..", &wayBack, 0) == 0;
        if (!searchable || !enter(std::move(directory), name)) {
            ::unlinkat(m_here.get(), name.c_str(), AT_REMOVEDIR);
        }
    }

    /// Goes back to the parent and removes the directory left; false when the way back is lost.
    bool ascend() {
        Descriptor parent(::openat(m_here.get(), "..", directoryOnly));
        struct stat status {};
        if (!parent.isOpen() || ::fstat(parent.get(), &status) != 0 || !isSame(m_levels[m_levels.size() - 2], status)) {
            return false;
        }
        ::unlinkat(parent.get(), m_levels.back().name.c_str(), AT_REMOVEDIR);
        m_levels.pop_back();
        m_here = std::move(parent);
        return true;
    }

    Descriptor m_here;
    std::vector<Level> m_levels;
};

bool isLink(const std::string& path) {
    struct stat status {};
    return ::lstat(path.c_str(), &status) == 0 && S_ISLNK(status.st_mode);
}

}  // namespace

bool removeTree(const char* path) {
    const std::string native = nativePath(path);
    if (native == "/") {
        return false;
    }
    if (isLink(native)) {
        return ::unlink(native.c_str()) == 0;
    }
    Descriptor top(::open(native.c_str(), directoryOnly | O_NOFOLLOW));
    if (top.isOpen()) {
        TreeRemoval().empty(std::move(top));
    }
    return ::rmdir(native.c_str()) == 0;
}

}  // namespace platform
