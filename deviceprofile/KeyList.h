// The keys of one section, found by name.
#pragma once

#include <cstdint>
#include <string_view>
#include <vector>

namespace DeviceProfile {

/// A flat hash table of places in one text, which belongs to somebody else. At a place there is the key, a zero, its
/// value, and a zero. A value of several lines is joined when its key is found for the first time.
class KeyList {
public:
    /// All keys lie in the text that begins here, within its first 4 GiB.
    explicit KeyList(char* text) : m_text(text) {}

    /// Sets the key at this place of the text. Gives the line where it was set before, 0 when it is new.
    ///
    /// @param open where a value ends whose lines are still to be joined, null for a value that is ready
    std::uint32_t set(const char* key, std::uint32_t line, const char* open);

    /// The place of the key, or null.
    const char* find(std::string_view key);

private:
    struct Slot {
        std::uint32_t place;
        std::uint32_t line;  ///< counted from 1; 0 in a free slot
        std::uint32_t open;  ///< end of the lines that are to be joined; 0 when the value is ready
    };

    std::size_t slotOf(std::string_view key) const;
    void grow();

    char* m_text;
    std::vector<Slot> m_slots;  ///< a power of two, at least half of them free
    std::size_t m_count = 0;
};

}  // namespace DeviceProfile
