/// @file
/// Static file operations.
#pragma once

#include <cstdint>
#include <cstdio>

#include "HkStream.h"
#include "HkString.h"
#include "TessalExport.h"

namespace HostKit {

/// File operations by path. In a path both "/" and "\" separate; on Windows it is UTF-8 and may be longer than 260
/// characters. Null and the empty text name nothing. Failures come back as the result and are not reported.
class TESSAL_API HkFile {
public:
    /// True when something is there; a symbolic link stands for what it leads to.
    static bool exist(const char* path);
    /// True for a directory; a symbolic link stands for what it leads to.
    static bool isdir(const char* path);
    /// Makes a directory. With @p parents those missing on the way are made too, and a directory that is there already
    /// counts as made; without it the parent must be there and the directory not.
    static bool mkdir(const char* path, bool parents);
    /// Removes an empty directory.
    static bool rmdir(const char* path);
    /// Removes a directory with all that is in it and goes on past what cannot be removed; true when all of it is
    /// gone. Links are removed, never followed; a @p path that is a link is removed itself. Any depth will do.
    static bool rmtree(const char* path);
    /// Removes a file, a read-only one too, or a symbolic link itself; no directory.
    static bool remove_f(const char* path);
    /// Copies the content of a file. The destination is replaced as a whole, when the copy is complete; until then and
    /// after a failure it stays as it was, so no half a file is ever seen under its name. It keeps its access rights, a
    /// new one gets those of the source. False for a source that is no regular file, for a destination that is
    /// something else than a regular file, and when both are the same file.
    static bool copy(const char* source, const char* destination);
    /// The current directory as an absolute path; empty when it cannot be told.
    static HkString getcwd();
    /// Size of a regular file in bytes; 0 where there is none.
    static std::int64_t getsize_noopen(const char* path);
    /// Opens a file as std::fopen does; null when that fails. The caller closes it with std::fclose.
    static std::FILE* open(const char* path, const char* mode);
    /// The console stream.
    static HkStream& getCout();
};

}  // namespace HostKit

using HostKit::HkFile;
