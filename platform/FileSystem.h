// The host's file system by path text. In a path both "/" and "\" separate; it is neither null nor empty. Windows takes
// it as UTF-8 of any length. Nothing here reports: a failure is the result.
#pragma once

#include <cstdint>
#include <cstdio>
#include <string>
#include <vector>

namespace platform {

bool exists(const char* path);       ///< of what a link leads to
bool isDirectory(const char* path);  ///< of what a link leads to
/// Size of a regular file, 0 of anything else.
std::int64_t fileSize(const char* path);

/// Makes one directory, whose parent is there.
bool makeDirectory(const char* path);
/// Removes an empty directory, no link to one.
bool removeDirectory(const char* path);
/// Removes a file or a link, whatever a link leads to; a file's own write protection does not keep it.
bool removeFile(const char* path);
/// Removes a directory and what is in it, entering no link, and goes on past what stays; true when nothing stays. A
/// path that is a link is removed itself. The root of a file system is left alone.
bool removeTree(const char* path);
/// Puts a copy of a regular file in place of another one, or of nothing, in one step.
bool copyFile(const char* source, const char* destination);

/// The bare names in a directory, without "." and ".."; hidden ones only if asked for.
std::vector<std::string> listDirectory(const char* path, bool hiddenToo);
/// Absolute; empty when it cannot be told.
std::string currentDirectory();
std::FILE* openFile(const char* path, const char* mode);

}  // namespace platform
