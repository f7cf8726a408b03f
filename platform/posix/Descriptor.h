// Owner of a file descriptor.
#pragma once

#include <unistd.h>

#include <utility>

namespace platform {

class Descriptor {
public:
    Descriptor() = default;
    explicit Descriptor(int number) : m_number(number) {}
    Descriptor(Descriptor&& other) noexcept : m_number(other.release()) {}
    Descriptor& operator=(Descriptor&& other) noexcept {
        std::swap(m_number, other.m_number);
        return *this;
    }
    ~Descriptor() { close(); }

    bool isOpen() const { return m_number >= 0; }
    int number() const { return m_number; }
    int release() { return std::exchange(m_number, -1); }
    /// Closes it now; false when the host lost data that was written.
    bool close() { return m_number < 0 || ::close(release()) == 0; }

private:
    int m_number = -1;
};

}  // namespace platform
