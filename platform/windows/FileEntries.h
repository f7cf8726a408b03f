// Entries of a directory by their native names, which need not be good UTF-16.
#pragma once

#include <windows.h>

#include <string>
#include <vector>

namespace platform {

struct Entry {
    std::wstring name;
    DWORD attributes;
};

/// What is in the directory, without "." and "..".
std::vector<Entry> entriesOf(const std::wstring& directory);
/// Removes a file, an empty directory, or a link of either kind; its own write protection does not keep it.
bool removeEntry(const std::wstring& path, DWORD attributes);
/// Removes an empty directory or a link to a directory.
bool removeEmptyFolder(const std::wstring& path);

}  // namespace platform
