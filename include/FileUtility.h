/// @file
/// Path texts and simple file operations.
#pragma once

#include "HkString.h"
#include "TessalExport.h"

/// Static helpers for paths and files. Both "/" and "\" separate, in any mixture; where a path is joined, "/" is
/// written. A null text is the empty text. Messages go out as information messages.
class TESSAL_API FileUtility {
public:
    /// The text behind the last separator; the whole path when it holds none.
    static HkString getTail(const char* path);
    /// The text before the last separator; the whole path when it holds none.
    static HkString getHead(const char* path);
    /// The text before the last ".", wherever that stands; the whole path when it holds none.
    static HkString getBase(const char* path);
    /// True when the path's extension is "elf" or "mem" in any case.
    static bool isObjectFile(const char* path);

    /// Removes a directory with all that is in it. What cannot be removed is passed over in silence. A link is
    /// removed itself, at the top as well as inside, and never followed. Any depth will do.
    /// @return true always
    static bool rmdir(const char* path);

    /// Copies the file @p name from one directory into another one, which is made if it is missing, with its parents.
    /// A file of that name is replaced only by the whole copy. Every failure is reported.
    static bool copyFile(const char* fromDir, const char* toDir, const char* name);

    /// Makes a full path from a relative one.
    ///
    /// A path that begins with a separator or holds ":" is given back unchanged. Any other is taken from @p base, or
    /// from the current directory when @p base is empty or the path begins with "../". Components "." and ".." at its
    /// front are resolved, each ".." taking a directory from the root; a ".." that ends the path is dropped, and so are
    /// more ".." than the root has separators, all of them. What follows the front stays as it is. A front with another
    /// component that begins with a dot is reported, and the path is given back unchanged; a result where nothing is
    /// is reported and given back.
    static HkString convertPath(HkString path, HkString base);
};
