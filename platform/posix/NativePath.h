// Path texts as this host takes them.
#pragma once

#include <string>

namespace platform {

/// The path with "/" for "\" and without separators at its end; a root stays "/".
std::string nativePath(const char* path);

}  // namespace platform
