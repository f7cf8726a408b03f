#include "platform/windows/Replacement.h"

#include <windows.h>

#include <atomic>

#include "platform/windows/Handle.h"

namespace platform {
namespace {

constexpr DWORD shareAll = FILE_SHARE_READ | FILE_SHARE_WRITE | FILE_SHARE_DELETE;

std::atomic<unsigned> nextNumber{0};

}  // namespace

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

std::wstring temporaryBeside(const std::wstring& path) {
    const std::size_t separator = path.find_last_of(LR"(\:)");
    const std::wstring directory = separator != std::wstring::npos ? path.substr(0, separator + 1) : std::wstring();
    std::wstring name;
    do {
        name = directory + L".copy-" + std::to_wstring(GetCurrentProcessId()) + L'-' + std::to_wstring(nextNumber++);
    } while (GetFileAttributesW(name.c_str()) != INVALID_FILE_ATTRIBUTES);
    return name;
}

}  // namespace platform
