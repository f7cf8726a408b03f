// Reads what the kernel shows of ports below a root directory.
#pragma once

#include <cstdint>
#include <optional>
#include <string>
#include <vector>

#include "platform/DeviceInstaller.h"

namespace platform {

/// The kernel's files, by paths such as "/sys/class/tty". What is absent or unreadable reads as empty.
class PortTree {
public:
    explicit PortTree(std::string root) : m_root(std::move(root)) {}

    /// The names in a directory.
    std::vector<std::string> names(const std::string& directory) const;
    /// The start of a file; nothing where there is none. No file that counts here is longer than what is read.
    std::optional<std::string> read(const std::string& file) const;
    /// The last name in the target of a symbolic link.
    std::string linkedName(const std::string& link) const;

private:
    std::string m_root;
};

/// The ranges of I/O ports that the kernel has given to drivers: the lines of /proc/ioports.
class ClaimedRanges {
public:
    explicit ClaimedRanges(const std::string& lines);

    /// The range that begins at @p start, the innermost of several, with those that follow it without a gap and have
    /// the same owner; @p registers ports where the kernel does not tell, as it does not tell everyone.
    IoRange from(std::uint64_t start, unsigned registers) const;

private:
    struct Claim {
        IoRange range;
        std::string owner;
    };
    std::vector<Claim> m_claims;
};

}  // namespace platform
