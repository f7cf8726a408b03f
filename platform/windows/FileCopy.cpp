// Copying a file so that its destination is the old file or the whole new one at any time.
#include <windows.h>

#include <atomic>
#include <string>

#include "platform/FileSystem.h"
#include "platform/windows/FileEntries.h"
#include "platform/windows/Handle.h"
#include "platform/windows/NativePath.h"

namespace platform {
namespace {

constexpr DWORD shareAll = FILE_SHARE_READ | FILE_SHARE_WRITE | FILE_SHARE_DELETE;

std::atomic<unsigned> nextNumber{0};

struct Identity {
    bool exists = false;
    BY_HANDLE_FILE_INFORMATION information{};

    bool isFile() const { return exists && (information.dwFileAttributes & FILE_ATTRIBUTE_DIRECTORY) == 0; }
    bool isProtected() const { return (information.dwFileAttributes & FILE_ATTRIBUTE_READONLY) != 0; }
    bool isSame(const Identity& other) const {
        return exists && other.exists && information.dwVolumeSerialNumber == other.information.dwVolumeSerialNumber &&
               information.nFileIndexHigh == other.information.nFileIndexHigh &&
               information.nFileIndexLow == other.information.nFileIndexLow;
    }
};

Identity identify(const std::wstring& path) {
    const Handle file(CreateFileW(path.c_str(), FILE_READ_ATTRIBUTES, shareAll, nullptr, OPEN_EXISTING,
                                  FILE_FLAG_BACKUP_SEMANTICS, nullptr));
    Identity identity;
    identity.exists = file.isOpen() && GetFileInformationByHandle(file.get(), &identity.information) != 0;
    return identity;
}

/// What a link that leads somewhere stands for; any other path stays.
std::wstring linkResolved(const std::wstring& path) {
    const DWORD attributes = GetFileAttributesW(path.c_str());
    if (attributes == INVALID_FILE_ATTRIBUTES || (attributes & FILE_ATTRIBUTE_REPARSE_POINT) == 0) {
        return path;
    }
    const Handle file(CreateFileW(path.c_str(), FILE_READ_ATTRIBUTES, shareAll, nullptr, OPEN_EXISTING,
                                  FILE_FLAG_BACKUP_SEMANTICS, nullptr));
    const DWORD size = file.isOpen() ? GetFinalPathNameByHandleW(file.get(), nullptr, 0, 0) : 0;
    std::wstring target(size, L'\0');
    target.resize(size != 0 ? GetFinalPathNameByHandleW(file.get(), target.data(), size, 0) : 0);
    return target.empty() ? path : target;
}

/// A name that nobody uses, in the directory of the path.
std::wstring temporaryBeside(const std::wstring& path) {
    const std::size_t separator = path.find_last_of(LR"(\:)");
    const std::wstring directory = separator != std::wstring::npos ? path.substr(0, separator + 1) : std::wstring();
    std::wstring name;
    do {
        name = directory + L".copy-" + std::to_wstring(GetCurrentProcessId()) + L'-' + std::to_wstring(nextNumber++);
    } while (GetFileAttributesW(name.c_str()) != INVALID_FILE_ATTRIBUTES);
    return name;
}

}  // namespace

bool copyFile(const char* source, const char* destination) {
    const std::wstring from = nativePath(source);
    const std::wstring target = linkResolved(nativePath(destination));
    const Identity original = identify(from);
    const Identity former = identify(target);
    if (!original.isFile() || (former.exists && (!former.isFile() || former.isProtected())) ||
        former.isSame(original)) {
        return false;
    }
    const std::wstring copy = temporaryBeside(target);
    if (CopyFileW(from.c_str(), copy.c_str(), TRUE) != 0) {
        if (MoveFileExW(copy.c_str(), target.c_str(), MOVEFILE_REPLACE_EXISTING | MOVEFILE_WRITE_THROUGH) != 0) {
            return true;
        }
    } else if (GetLastError() == ERROR_FILE_EXISTS) {
        return false;  // somebody else's file, made this moment
    }
    removeEntry(copy, GetFileAttributesW(copy.c_str()));
    return false;
}

}  // namespace platform
