#include "platform/posix/Replacement.h"

#include <fcntl.h>
#include <sys/stat.h>
#include <unistd.h>

#include <atomic>
#include <cstdio>
#include <cstdlib>
#include <memory>

namespace platform {
namespace {

std::atomic<unsigned> nextNumber{0};

}  // namespace

std::string linkResolved(const std::string& path) {
    const std::unique_ptr<char, void (*)(void*)> resolved(::realpath(path.c_str(), nullptr), &std::free);
    return resolved != nullptr ? resolved.get() : path;
}

Replacement::Replacement(std::string target, mode_t rights) : m_target(std::move(target)) {
    const std::string directory = m_target.substr(0, m_target.rfind('/') + 1);
    do {
        m_name = directory + ".copy-" + std::to_string(::getpid()) + '-' + std::to_string(nextNumber++);
        m_file = Descriptor(::open(m_name.c_str(), O_WRONLY | O_CREAT | O_EXCL | O_CLOEXEC, rights));
    } while (!m_file.isOpen() && errno == EEXIST);
    m_exists = m_file.isOpen();
}

Replacement::~Replacement() {
    if (m_exists) {
        ::unlink(m_name.c_str());
    }
}

bool Replacement::setRights(mode_t rights) {
    return ::fchmod(m_file.get(), rights) == 0;
}

bool Replacement::write(const char* data, std::size_t size) {
    while (size > 0) {
        const ssize_t written = uninterrupted([&] { return ::write(m_file.get(), data, size); });
        if (written <= 0) {
            return false;
        }
        data += written;
        size -= static_cast<std::size_t>(written);
    }
    return true;
}

bool Replacement::store() {
    return ::fsync(m_file.get()) == 0 || errno == EINVAL;  // EINVAL: nothing to be stored
}

bool Replacement::putInPlace() {
    if (::rename(m_name.c_str(), m_target.c_str()) != 0) {
        return false;
    }
    m_exists = false;
    return true;
}

}  // namespace platform
