// Copying a file so that its destination is the old file or the whole new one at any time.
#include <fcntl.h>
#include <sys/stat.h>
#include <unistd.h>

#include <atomic>
#include <cerrno>
#include <cstdlib>
#include <memory>
#include <string>

#include "platform/FileSystem.h"
#include "platform/posix/Descriptor.h"
#include "platform/posix/NativePath.h"

namespace platform {
namespace {

constexpr mode_t accessRights = 0777;

/// Calls until no signal breaks in.
template <class Call>
auto uninterrupted(Call call) {
    for (;;) {
        const auto result = call();
        if (result >= 0 || errno != EINTR) {
            return result;
        }
    }
}

std::atomic<unsigned> nextNumber{0};

/// A new file beside another one, which it replaces when it is complete; without that it leaves no trace.
class Replacement {
public:
    Replacement(std::string target, mode_t rights) : m_target(std::move(target)) {
        const std::string directory = m_target.substr(0, m_target.rfind('/') + 1);
        do {
            m_name = directory + ".copy-" + std::to_string(::getpid()) + '-' + std::to_string(nextNumber++);
            m_file = Descriptor(::open(m_name.c_str(), O_WRONLY | O_CREAT | O_EXCL | O_CLOEXEC, rights));
        } while (!m_file.isOpen() && errno == EEXIST);
        m_exists = m_file.isOpen();
    }
    Replacement(const Replacement&) = delete;
    Replacement& operator=(const Replacement&) = delete;
    ~Replacement() {
        if (m_exists) {
            ::unlink(m_name.c_str());
        }
    }

    bool isOpen() const { return m_file.isOpen(); }

    /// Gives it exactly these rights, whatever the process's mask says.
    bool setRights(mode_t rights) { return ::fchmod(m_file.number(), rights) == 0; }

    bool write(const char* data, std::size_t size) {
        while (size > 0) {
            const ssize_t written = uninterrupted([&] { return ::write(m_file.number(), data, size); });
            if (written <= 0) {
                return false;
            }
            data += written;
            size -= static_cast<std::size_t>(written);
        }
        return true;
    }

    bool commit() {
        const bool stored = ::fsync(m_file.number()) == 0 || errno == EINVAL;  // EINVAL: nothing to be stored
        if (!m_file.close() || !stored || ::rename(m_name.c_str(), m_target.c_str()) != 0) {
            return false;
        }
        m_exists = false;
        return true;
    }

private:
    std::string m_target;
    std::string m_name;
    Descriptor m_file;
    bool m_exists = false;
};

bool transfer(const Descriptor& source, Replacement& copy) {
    constexpr std::size_t chunk = 128 * 1024;
    const std::unique_ptr<char[]> buffer(new char[chunk]);
    for (;;) {
        const ssize_t got = uninterrupted([&] { return ::read(source.number(), buffer.get(), chunk); });
        if (got <= 0) {
            return got == 0;
        }
        if (!copy.write(buffer.get(), static_cast<std::size_t>(got))) {
            return false;
        }
    }
}

/// Where a path leads: itself, or what a link that leads somewhere stands for.
std::string linkResolved(const std::string& path) {
    const std::unique_ptr<char, void (*)(void*)> resolved(::realpath(path.c_str(), nullptr), &std::free);
    return resolved != nullptr ? resolved.get() : path;
}

}  // namespace

bool copyFile(const char* source, const char* destination) {
    const Descriptor from(uninterrupted(
        [&] { return ::open(nativePath(source).c_str(), O_RDONLY | O_CLOEXEC | O_NONBLOCK | O_NOCTTY); }));
    struct stat original {};
    if (!from.isOpen() || ::fstat(from.number(), &original) != 0 || !S_ISREG(original.st_mode)) {
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
           copy.commit();
}

}  // namespace platform
