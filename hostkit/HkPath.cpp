#include "HkPath.h"

#include <cstring>

#include "HkStr.h"

namespace HostKit {
namespace {

const char* lastComponent(const char* path) {
    const char* component = path;
    for (; *path != '\0'; ++path) {
        if (HkPath::IsSeparator(*path)) {
            component = path + 1;
        }
    }
    return component;
}

const char* findExtension(const char* path) {
    if (path == nullptr) {
        return nullptr;
    }
    const char* const name = lastComponent(path);
    const char* const dot = std::strrchr(name, '.');
    return dot != nullptr && dot != name && dot[1] != '\0' ? dot + 1 : nullptr;
}

}  // namespace

const char* HkPath::GetExt(const char* path, char* buffer) {
    const char* const extension = findExtension(path);
    if (buffer != nullptr) {
        HkStr::NCopy(buffer, extension, extensionSize - 1);
        buffer[extensionSize - 1] = '\0';
    }
    return extension;
}

char* HkPath::GetExt(char* path, char* buffer) {
    return const_cast<char*>(GetExt(static_cast<const char*>(path), buffer));
}

}  // namespace HostKit
