#include "platform/FileSystem.h"

#include <windows.h>

#include "platform/windows/FileEntries.h"
#include "platform/windows/Handle.h"
#include "platform/windows/NativePath.h"

namespace platform {
namespace {

constexpr DWORD shareAll = FILE_SHARE_READ | FILE_SHARE_WRITE | FILE_SHARE_DELETE;

bool isLink(DWORD attributes) {
    return attributes != INVALID_FILE_ATTRIBUTES && (attributes & FILE_ATTRIBUTE_REPARSE_POINT) != 0;
}

bool isFolder(DWORD attributes) {
    return attributes != INVALID_FILE_ATTRIBUTES && (attributes & FILE_ATTRIBUTE_DIRECTORY) != 0;
}

/// Attributes of what a link leads to.
DWORD followedAttributes(const std::wstring& path) {
    const DWORD attributes = GetFileAttributesW(path.c_str());
    if (!isLink(attributes)) {
        return attributes;
    }
    const Handle target(CreateFileW(path.c_str(), FILE_READ_ATTRIBUTES, shareAll, nullptr, OPEN_EXISTING,
                                    FILE_FLAG_BACKUP_SEMANTICS, nullptr));
    BY_HANDLE_FILE_INFORMATION information{};
    return target.isOpen() && GetFileInformationByHandle(target.get(), &information) != 0 ? information.dwFileAttributes
                                                                                          : INVALID_FILE_ATTRIBUTES;
}

/// Removes by the call, if need be after taking the write protection away.
bool removeBy(BOOL(WINAPI* call)(const wchar_t*), const wchar_t* path, DWORD attributes) {
    if (call(path) != 0) {
        return true;
    }
    return GetLastError() == ERROR_ACCESS_DENIED && attributes != INVALID_FILE_ATTRIBUTES &&
           (attributes & FILE_ATTRIBUTE_READONLY) != 0 &&
           SetFileAttributesW(path, attributes & ~static_cast<DWORD>(FILE_ATTRIBUTE_READONLY)) != 0 && call(path) != 0;
}

}  // namespace

std::vector<Entry> entriesOf(const std::wstring& directory) {
    std::vector<Entry> entries;
    WIN32_FIND_DATAW found{};
    HANDLE const listing = FindFirstFileW((directory + LR"(\*)").c_str(), &found);
    if (listing == INVALID_HANDLE_VALUE) {
        return entries;
    }
    do {
        std::wstring name = found.cFileName;
        if (name != L"." && name != L"..") {
            entries.push_back({std::move(name), found.dwFileAttributes});
        }
    } while (FindNextFileW(listing, &found) != 0);
    FindClose(listing);
    return entries;
}

bool removeEmptyFolder(const std::wstring& path) {
    return removeBy(&RemoveDirectoryW, path.c_str(), GetFileAttributesW(path.c_str()));
}

bool removeEntry(const std::wstring& path, DWORD attributes) {
    return removeBy(isFolder(attributes) ? &RemoveDirectoryW : &DeleteFileW, path.c_str(), attributes);
}

bool exists(const char* path) {
    return followedAttributes(nativePath(path)) != INVALID_FILE_ATTRIBUTES;
}

bool isDirectory(const char* path) {
    return isFolder(followedAttributes(nativePath(path)));
}

std::int64_t fileSize(const char* path) {
    const Handle file(
        CreateFileW(nativePath(path).c_str(), FILE_READ_ATTRIBUTES, shareAll, nullptr, OPEN_EXISTING, 0, nullptr));
    LARGE_INTEGER size{};
    return file.isOpen() && GetFileType(file.get()) == FILE_TYPE_DISK && GetFileSizeEx(file.get(), &size) != 0
               ? size.QuadPart
               : 0;
}

bool makeDirectory(const char* path) {
    return CreateDirectoryW(nativePath(path).c_str(), nullptr) != 0;
}

bool removeDirectory(const char* path) {
    const std::wstring native = nativePath(path);
    return !isLink(GetFileAttributesW(native.c_str())) && removeEmptyFolder(native);
}

bool removeFile(const char* path) {
    const std::wstring native = nativePath(path);
    const DWORD attributes = GetFileAttributesW(native.c_str());
    return (isLink(attributes) || !isFolder(attributes)) && removeEntry(native, attributes);
}

std::vector<std::string> listDirectory(const char* path, bool hiddenToo) {
    std::vector<std::string> names;
    for (const Entry& entry : entriesOf(nativePath(path))) {
        if (hiddenToo || (entry.attributes & FILE_ATTRIBUTE_HIDDEN) == 0) {
            names.push_back(utf8Text(entry.name.c_str()));
        }
    }
    return names;
}

std::string currentDirectory() {
    std::wstring text(MAX_PATH, L'\0');
    for (;;) {
        const DWORD length = GetCurrentDirectoryW(static_cast<DWORD>(text.size()), text.data());
        const bool fits = length < text.size();
        text.resize(length);
        if (fits) {
            return utf8Text(text.c_str());
        }
    }
}

std::FILE* openFile(const char* path, const char* mode) {
    return _wfopen(nativePath(path).c_str(), wideText(mode).c_str());
}

}  // namespace platform
