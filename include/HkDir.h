/// @file
/// Listing of directories.
#pragma once

#include <cstddef>
#include <memory>
#include <string>
#include <vector>

#include "TessalExport.h"

namespace HostKit {

/// A place in a listing. The names were all read when the listing began, so entries may be removed or made while it
/// goes on; copies go their own way.
class TESSAL_API HkDirIterator {
public:
    /// The end of every listing.
    HkDirIterator() = default;

    /// Two places are equal when both are the end, or when both stand at the same entry of one listing.
    bool operator==(const HkDirIterator& other) const noexcept { return m_name == other.m_name; }
    bool operator!=(const HkDirIterator& other) const noexcept { return m_name != other.m_name; }

    /// The entry's bare name in UTF-8, owned by the listing; null at the end.
    const char* const& operator*() const noexcept { return m_name; }

    /// Goes to the next entry; at the end it stays there.
    HkDirIterator& operator++();

private:
    friend class HkDir;
    using Names = std::vector<std::string>;

    explicit HkDirIterator(Names names);
    void settle();

    std::shared_ptr<const Names> m_names;
    std::size_t m_index = 0;
    const char* m_name = nullptr;
};

/// A directory for listing. A directory that is absent or unreadable lists nothing.
class TESSAL_API HkDir {
public:
    /// @param path the directory; both separators are taken
    /// @param flag 1 lists every entry; 0 leaves out those that the host calls hidden
    /// Neither lists "." or "..".
    HkDir(const char* path, unsigned char flag);

    /// Reads the directory and gives the first entry that matches the pattern, in no particular order. In a pattern
    /// `*` stands for any run of characters, and case does not count; `*.*` and null match every entry.
    HkDirIterator begin(const char* pattern) const;

    /// The end of the listing.
    HkDirIterator end() const { return {}; }

private:
    std::string m_path;
    unsigned char m_flag;
};

}  // namespace HostKit

using HostKit::HkDir;
using HostKit::HkDirIterator;
