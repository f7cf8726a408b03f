#include "platform/HostPaths.h"

#include <windows.h>

#include <filesystem>

namespace HostPaths {
namespace {

const char anchor = 0;
constexpr std::size_t longestPath = 32768;

HMODULE ownModule() {
    HMODULE module = nullptr;
    constexpr DWORD flags = GET_MODULE_HANDLE_EX_FLAG_FROM_ADDRESS | GET_MODULE_HANDLE_EX_FLAG_UNCHANGED_REFCOUNT;
    return GetModuleHandleExW(flags, reinterpret_cast<LPCWSTR>(&anchor), &module) != 0 ? module : nullptr;
}

}  // namespace

std::string libraryFile() {
    std::wstring name(longestPath, L'\0');
    name.resize(GetModuleFileNameW(ownModule(), name.data(), static_cast<DWORD>(name.size())));
    try {
        return std::filesystem::path(name).u8string();
    } catch (const std::exception&) {
        return {};  // a name that is no valid UTF-16
    }
}

const char listSeparator = ';';
const char* const libraryPrefix = "lib";
const char* const libraryEnding = ".dll";
const char* const programEnding = ".exe";

}  // namespace HostPaths
