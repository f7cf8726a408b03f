// Removal of a directory tree that nobody can lead astray. Each directory between the top and the one that is being
// emptied is held open as itself, not as what a reparse point leads to, and without leave to rename or remove it: while
// it is open, no reparse point can take its place. The way back is kept in memory and not on the stack.
#include <windows.h>

#include <string>
#include <utility>
#include <vector>

#include "platform/FileSystem.h"
#include "platform/windows/FileEntries.h"
#include "platform/windows/Handle.h"
#include "platform/windows/NativePath.h"

namespace platform {
namespace {

constexpr DWORD folderOrLink = FILE_ATTRIBUTE_DIRECTORY | FILE_ATTRIBUTE_REPARSE_POINT;

bool isPlainFolder(DWORD attributes) {
    return attributes != INVALID_FILE_ATTRIBUTES && (attributes & folderOrLink) == FILE_ATTRIBUTE_DIRECTORY;
}

/// Holds a directory that is no reparse point; not open for anything else.
Handle holdFolder(const std::wstring& path) {
    Handle folder(CreateFileW(path.c_str(), FILE_READ_ATTRIBUTES | FILE_LIST_DIRECTORY,
                              FILE_SHARE_READ | FILE_SHARE_WRITE, nullptr, OPEN_EXISTING,
                              FILE_FLAG_BACKUP_SEMANTICS | FILE_FLAG_OPEN_REPARSE_POINT, nullptr));
    BY_HANDLE_FILE_INFORMATION information{};
    const bool good = folder.isOpen() && GetFileInformationByHandle(folder.get(), &information) != 0 &&
                      isPlainFolder(information.dwFileAttributes);
    return good ? std::move(folder) : Handle();
}

/// A directory between the top of the tree and the one that is being emptied, both included.
struct Level {
    Handle held;
    std::size_t pathLength;                    ///< of the path that ends with this directory
    std::vector<std::wstring> subdirectories;  ///< those not yet entered
};

class TreeRemoval {
public:
    explicit TreeRemoval(std::wstring top) : m_path(std::move(top)) {}

    /// Removes the directory with all that is in it, as far as that can be done.
    bool run() {
        bool removed = enterOrRemove();
        while (!m_levels.empty()) {
            Level& level = m_levels.back();
            m_path.resize(level.pathLength);
            if (level.subdirectories.empty()) {
                m_levels.pop_back();
                removed = removeEmptyFolder(m_path);
            } else {
                m_path += L'\\' + level.subdirectories.back();
                level.subdirectories.pop_back();
                enterOrRemove();
            }
        }
        return removed;
    }

private:
    /// Makes the directory at the path the one to empty: removes its files and notes its subdirectories. One that
    /// cannot be held is removed at once: it is empty or a link, or has to stay.
    bool enterOrRemove() {
        Handle held = holdFolder(m_path);
        if (!held.isOpen()) {
            return removeEmptyFolder(m_path);
        }
        Level level{std::move(held), m_path.size(), {}};
        for (Entry& entry : entriesOf(m_path)) {
            if (isPlainFolder(entry.attributes)) {
                level.subdirectories.push_back(std::move(entry.name));
            } else {
                removeEntry(m_path + L'\\' + entry.name, entry.attributes);
            }
        }
        m_levels.push_back(std::move(level));
        return false;
    }

    std::wstring m_path;
    std::vector<Level> m_levels;
};

bool isRoot(const std::wstring& path) {
    return path.back() == L':';
}

}  // namespace

bool removeTree(const char* path) {
    std::wstring top = nativePath(path, true);
    while (!top.empty() && top.back() == L'\\') {
        top.pop_back();
    }
    if (top.empty() || isRoot(top)) {
        return false;
    }
    const DWORD attributes = GetFileAttributesW(top.c_str());
    if (isPlainFolder(attributes)) {
        return TreeRemoval(std::move(top)).run();
    }
    const bool isLink = attributes != INVALID_FILE_ATTRIBUTES && (attributes & FILE_ATTRIBUTE_REPARSE_POINT) != 0;
    return isLink && removeEntry(top, attributes);
}

}  // namespace platform
