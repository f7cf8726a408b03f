/// @file
/// Static helpers for path texts.
#pragma once

#include <cstddef>

#include "TessalExport.h"

namespace HostKit {

/// Looks into path texts, in which both "/" and "\" separate. Nothing here asks the file system.
class TESSAL_API HkPath {
public:
    /// Bytes that GetExt may write into its buffer, terminator included.
    static constexpr std::size_t extensionSize = 8;

    /// The extension of the path's last component: a pointer into @p path behind the last dot. Null when there is
    /// none: no dot, nothing behind it, or a name such as ".profile" whose only dot is its first character.
    /// A buffer that is not null gets the extension as in the other form.
    static const char* GetExt(const char* path, char* buffer);

    /// The same for a writable path; @p buffer, of extensionSize bytes, gets the extension, cut to its first seven
    /// bytes, or the empty text when there is none.
    static char* GetExt(char* path, char* buffer);

    /// True for "/" and "\".
    static constexpr bool IsSeparator(char ch) { return ch == '/' || ch == '\\'; }
};

}  // namespace HostKit

using HostKit::HkPath;
