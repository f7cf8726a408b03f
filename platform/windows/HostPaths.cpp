#include "platform/HostPaths.h"

#include <windows.h>

#include <exception>
#include <filesystem>
#include <string>

namespace platform {
namespace {

const char anchor = 0;
/// No path and no environment variable is longer on this host.
constexpr DWORD longestText = 32768;

HMODULE ownModule() {
    HMODULE module = nullptr;
    constexpr DWORD flags = GET_MODULE_HANDLE_EX_FLAG_FROM_ADDRESS | GET_MODULE_HANDLE_EX_FLAG_UNCHANGED_REFCOUNT;
    return GetModuleHandleExW(flags, reinterpret_cast<LPCWSTR>(&anchor), &module) != 0 ? module : nullptr;
}

/// Empty for a text that is no valid UTF-16.
std::string toUtf8(const std::wstring& text) {
    try {
        return std::filesystem::path(text).u8string();
    } catch (const std::exception&) {
        return {};
    }
}

}  // namespace

std::string libraryFile() {
    std::wstring file(longestText, L'\0');
    file.resize(GetModuleFileNameW(ownModule(), file.data(), longestText));
    return toUtf8(file);
}

std::string environmentValue(const char* name) {
    std::wstring value(longestText, L'\0');
    value.resize(GetEnvironmentVariableW(std::filesystem::u8path(name).c_str(), value.data(), longestText));
    return toUtf8(value);
}

const char listSeparator = ';';
const char* const libraryPrefix = "lib";
const char* const libraryEnding = ".dll";
const char* const programEnding = ".exe";

}  // namespace platform
