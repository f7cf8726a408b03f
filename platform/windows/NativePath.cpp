#include "platform/windows/NativePath.h"

#include <windows.h>

#include <algorithm>

namespace platform {
namespace {

constexpr std::size_t longestLimited = 240;  // a directory's name leaves room for a short file name in it

bool startsWith(const std::wstring& text, const wchar_t* start) {
    return text.rfind(start, 0) == 0;
}

std::wstring absolute(const std::wstring& path) {
    std::wstring full(MAX_PATH, L'\0');
    for (;;) {
        const DWORD length = GetFullPathNameW(path.c_str(), static_cast<DWORD>(full.size()), full.data(), nullptr);
        const bool fits = length < full.size();
        full.resize(length);
        if (fits) {
            return full;
        }
    }
}

}  // namespace

std::wstring wideText(const char* utf8) {
    const int size = MultiByteToWideChar(CP_UTF8, 0, utf8, -1, nullptr, 0);
    std::wstring wide(static_cast<std::size_t>(std::max(size, 1)), L'\0');
    MultiByteToWideChar(CP_UTF8, 0, utf8, -1, wide.data(), size);
    wide.pop_back();
    return wide;
}

std::string utf8Text(const wchar_t* wide) {
    const int size = WideCharToMultiByte(CP_UTF8, 0, wide, -1, nullptr, 0, nullptr, nullptr);
    std::string utf8(static_cast<std::size_t>(std::max(size, 1)), '\0');
    WideCharToMultiByte(CP_UTF8, 0, wide, -1, utf8.data(), size, nullptr, nullptr);
    utf8.pop_back();
    return utf8;
}

std::wstring nativePath(const char* path, bool alwaysUnlimited) {
    std::wstring native = wideText(path);
    std::replace(native.begin(), native.end(), L'/', L'\\');
    if (startsWith(native, LR"(\\?\)") || startsWith(native, LR"(\\.\)")) {
        return native;
    }
    const std::wstring full = absolute(native);
    if (full.empty() || (full.size() < longestLimited && !alwaysUnlimited)) {
        return native;
    }
    return startsWith(full, LR"(\\)") ? LR"(\\?\UNC)" + full.substr(1) : LR"(\\?\)" + full;
}

}  // namespace platform
