// Where this library lies on the host, and how the host names directories and files.
#pragma once

#include <string>

namespace platform {

/// The file that this code was loaded from, in UTF-8: the shared library, or the program that it is linked into.
/// Empty when the host does not tell.
std::string libraryFile();

/// The value of an environment variable in UTF-8; empty when it is not set.
std::string environmentValue(const char* name);

/// Separates the members of a list of directories.
extern const char listSeparator;

/// What the host puts before and behind the name of a shared library, and behind the name of a program.
extern const char* const libraryPrefix;
extern const char* const libraryEnding;
extern const char* const programEnding;

}  // namespace platform
