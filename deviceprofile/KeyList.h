// The keys of one section, found by name.
#pragma once

#include <cstdint>
#include <string_view>
#include <vector>

namespace DeviceProfile {

/// A flat hash table of places in one text, which belongs to somebody else. At a place there is the key, a zero, its
/// value, and a zero.
class KeyList {
public:
    /// All keys lie in the text that begins here, within its first 4 GiB.
    explicit KeyList(const char* text) : m_text(text) {}

    /// Sets the key at this place of the text. Gives the line where it was set before, 0 when it is new.
    std::uint32_t set(const char* key, std::uint32_t line);

    /// The place of the key, or null.
    const char* find(std::string_view key) const;

private:
    struct Slot {
        std::uint32_t place;
        std::uint32_t line;  ///< counted from 1; 0 in a free slot
    };

    std::size_t slotOf(std::string_view key) const;
    void grow();

    const char* m_text;
    std::vector<Slot> m_slots;  ///< a power of two, at least half of them free
    std::size_t m_count = 0;
};

}  // namespace DeviceProfile
