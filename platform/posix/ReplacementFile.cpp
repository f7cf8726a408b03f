#include "platform/ReplacementFile.h"

#include <sys/stat.h>
#include <unistd.h>

#include <optional>
#include <system_error>

#include "platform/posix/NativePath.h"
#include "platform/posix/Replacement.h"

namespace platform {

struct ReplacementFile::Host {
    std::optional<Replacement> file;
    int error = 0;

    bool note(bool done) {
        if (!done) {
            error = errno;
        }
        return done;
    }

    void open(const std::string& target) {
        constexpr mode_t everyoneReadsAndWrites = 0666;  // less what the process's mask takes away
        constexpr mode_t accessRights = 0777;
        struct stat former {};
        const bool replaces = ::stat(target.c_str(), &former) == 0;
        if (replaces && !S_ISREG(former.st_mode)) {
            error = S_ISDIR(former.st_mode) ? EISDIR : EINVAL;
        } else if (!replaces || note(::access(target.c_str(), W_OK) == 0)) {
            file.emplace(target, everyoneReadsAndWrites);
            if (!note(file->isOpen()) || (replaces && !note(file->setRights(former.st_mode & accessRights)))) {
                file.reset();
            }
        }
    }
};

ReplacementFile::ReplacementFile(const char* path) : m_host(std::make_unique<Host>()) {
    m_host->open(linkResolved(nativePath(path)));
}

ReplacementFile::~ReplacementFile() = default;

bool ReplacementFile::isOpen() const {
    return m_host->file.has_value();
}

bool ReplacementFile::write(const char* data, std::size_t size) {
    return m_host->note(m_host->file->write(data, size));
}

bool ReplacementFile::close() {
    return m_host->note(m_host->file->close());
}

bool ReplacementFile::putInPlace() {
    return m_host->note(m_host->file->putInPlace());
}

std::string ReplacementFile::problem() const {
    return std::generic_category().message(m_host->error);
}

}  // namespace platform
