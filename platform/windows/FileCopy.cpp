// Copying a file so that its destination is the old file or the whole new one at any time.
#include <windows.h>

#include <string>

#include "platform/FileSystem.h"
#include "platform/windows/FileEntries.h"
#include "platform/windows/Handle.h"
#include "platform/windows/NativePath.h"
#include "platform/windows/Replacement.h"

namespace platform {
namespace {

constexpr DWORD shareAll = FILE_SHARE_READ | FILE_SHARE_WRITE | FILE_SHARE_DELETE;

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
