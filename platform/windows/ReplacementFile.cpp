#include "platform/ReplacementFile.h"

#include <windows.h>

#include <algorithm>
#include <system_error>

#include "platform/windows/FileEntries.h"
#include "platform/windows/Handle.h"
#include "platform/windows/NativePath.h"
#include "platform/windows/Replacement.h"

namespace platform {

struct ReplacementFile::Host {
    std::wstring target;
    std::wstring name;
    Handle file;
    bool exists = false;
    DWORD error = ERROR_SUCCESS;

    ~Host() {
        file = Handle();
        if (exists) {
            removeEntry(name, GetFileAttributesW(name.c_str()));
        }
    }

    bool note(bool done) {
        if (!done) {
            error = GetLastError();
        }
        return done;
    }

    void open() {
        const DWORD former = GetFileAttributesW(target.c_str());
        if (former != INVALID_FILE_ATTRIBUTES &&
            (former & (FILE_ATTRIBUTE_DIRECTORY | FILE_ATTRIBUTE_READONLY | FILE_ATTRIBUTE_DEVICE)) != 0) {
            error = ERROR_ACCESS_DENIED;
            return;
        }
        do {
            name = temporaryBeside(target);
            file = Handle(
                CreateFileW(name.c_str(), GENERIC_WRITE, 0, nullptr, CREATE_NEW, FILE_ATTRIBUTE_NORMAL, nullptr));
            exists = note(file.isOpen());
        } while (!exists && error == ERROR_FILE_EXISTS);
    }

    bool write(const char* data, std::size_t size) {
        constexpr std::size_t chunk = std::size_t{1} << 30;
        while (size > 0) {
            DWORD written = 0;
            const auto part = static_cast<DWORD>(std::min(size, chunk));
            if (!note(WriteFile(file.get(), data, part, &written, nullptr) != 0)) {
                return false;
            }
            if (written == 0) {
                error = ERROR_DISK_FULL;
                return false;
            }
            data += written;
            size -= written;
        }
        return true;
    }
};

ReplacementFile::ReplacementFile(const char* path) : m_host(std::make_unique<Host>()) {
    m_host->target = linkResolved(nativePath(path));
    m_host->open();
}

ReplacementFile::~ReplacementFile() = default;

bool ReplacementFile::isOpen() const {
    return m_host->exists;
}

bool ReplacementFile::write(const char* data, std::size_t size) {
    return m_host->write(data, size);
}

bool ReplacementFile::close() {
    m_host->file = Handle();
    return true;  // the host tells of a full disk at the writing
}

bool ReplacementFile::putInPlace() {
    const bool done = m_host->note(MoveFileExW(m_host->name.c_str(), m_host->target.c_str(),
                                               MOVEFILE_REPLACE_EXISTING | MOVEFILE_WRITE_THROUGH) != 0);
    m_host->exists = !done;
    return done;
}

std::string ReplacementFile::problem() const {
    return std::system_category().message(static_cast<int>(m_host->error));
}

}  // namespace platform
