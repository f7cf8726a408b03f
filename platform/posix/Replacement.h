// A new file beside another one, by the host's own means.
#pragma once

#include <sys/types.h>

#include <cerrno>
#include <string>

#include "platform/posix/Descriptor.h"

namespace platform {

/// Calls until no signal breaks in.
template <class Call>
auto uninterrupted(Call call) {
    for (;;) {
        const auto result = call();
        if (result >= 0 || errno != EINTR) {
            return result;
        }
    }
}

/// Where a path leads: itself, or what a link that leads somewhere stands for.
std::string linkResolved(const std::string& path);

/// It leaves no trace unless it is put in place.
class Replacement {
public:
    Replacement(std::string target, mode_t rights);
    Replacement(const Replacement&) = delete;
    Replacement& operator=(const Replacement&) = delete;
    ~Replacement();

    bool isOpen() const { return m_file.isOpen(); }
    /// Gives it exactly these rights, whatever the process's mask says.
    bool setRights(mode_t rights);
    bool write(const char* data, std::size_t size);
    /// Forces what was written onto the medium.
    bool store();
    bool close() { return m_file.close(); }
    /// Gives the closed file the target's name.
    bool putInPlace();

private:
    std::string m_target;
    std::string m_name;
    Descriptor m_file;
    bool m_exists = false;
};

}  // namespace platform
