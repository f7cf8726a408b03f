// Where this library lies on the host, and how the host writes a list of directories.
#pragma once

#include <string>

namespace HostPaths {

/// The file that this code was loaded from, in UTF-8: the shared library, or the program that it is linked into.
/// Empty when the host does not tell.
std::string libraryFile();

/// Separates the members of a list of directories.
extern const char listSeparator;

/// What the host puts before and behind the name of a shared library, and behind the name of a program.
extern const char* const libraryPrefix;
extern const char* const libraryEnding;
extern const char* const programEnding;

}  // namespace HostPaths
