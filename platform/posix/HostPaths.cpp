#include "platform/HostPaths.h"

#include <dlfcn.h>
#include <link.h>

#include <cstdint>
#include <cstdlib>
#include <filesystem>
#include <system_error>

namespace platform {
namespace {

const char anchor = 0;

bool holdsAnchor(const dl_phdr_info& object) {
    const auto wanted = reinterpret_cast<std::uintptr_t>(&anchor);
    for (unsigned i = 0; i < object.dlpi_phnum; ++i) {
        const auto& segment = object.dlpi_phdr[i];
        const std::uintptr_t start = object.dlpi_addr + segment.p_vaddr;
        if (segment.p_type == PT_LOAD && wanted >= start && wanted - start < segment.p_memsz) {
            return true;
        }
    }
    return false;
}

/// Looks at the first object only, which is the program.
int visitProgram(dl_phdr_info* object, std::size_t, void* result) {
    *static_cast<bool*>(result) = holdsAnchor(*object);
    return 1;
}

/// The dynamic linker knows the program only by the name that it was called by.
bool isLinkedIntoProgram() {
    bool result = false;
    dl_iterate_phdr(&visitProgram, &result);
    return result;
}

}  // namespace

std::string libraryFile() {
    std::error_code error;
    if (isLinkedIntoProgram()) {
        return std::filesystem::read_symlink("/proc/self/exe", error).string();
    }
    Dl_info info{};
    if (dladdr(&anchor, &info) == 0 || info.dli_fname == nullptr) {
        return {};
    }
    return std::filesystem::canonical(info.dli_fname, error).string();
}

std::string environmentValue(const char* name) {
    const char* const value = std::getenv(name);
    return value != nullptr ? value : "";
}

const char listSeparator = ':';
const char* const libraryPrefix = "lib";
const char* const libraryEnding = ".so";
const char* const programEnding = "";

}  // namespace platform
