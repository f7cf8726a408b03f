// Owner of something that the host names by a number or pointer, and closes once.
#pragma once

#include <utility>

namespace platform {

/// @tparam Rules the Value, what none() is, whether a value isOpen(), and how to close() one
template <class Rules>
class Owner {
public:
    using Value = typename Rules::Value;

    Owner() = default;
    explicit Owner(Value value) : m_value(value) {}
    Owner(Owner&& other) noexcept : m_value(other.release()) {}
    Owner& operator=(Owner&& other) noexcept {
        std::swap(m_value, other.m_value);
        return *this;
    }
    ~Owner() { close(); }

    bool isOpen() const { return Rules::isOpen(m_value); }
    Value get() const { return m_value; }
    Value release() { return std::exchange(m_value, Rules::none()); }
    /// Closes it now; false when the host could not, or lost data that was written.
    bool close() { return !isOpen() || Rules::close(release()); }

private:
    Value m_value = Rules::none();
};

}  // namespace platform
