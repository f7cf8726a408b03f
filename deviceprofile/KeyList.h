// The keys of one section, found by name.
#pragma once

#include <cstdint>
#include <string_view>
#include <vector>

namespace DeviceProfile {

struct KeyEntry {
    std::string_view key;
    std::string_view value;  ///< a zero stands behind it
    std::uint32_t line;
};

/// A flat hash table over texts that belong to somebody else.
class KeyList {
public:
    /// Sets a key. Gives the line where it was set before, 0 when it is new.
    std::uint32_t set(const KeyEntry& entry);

    /// The entry of the key, or null. Entries stay where they are once all keys are set.
    const KeyEntry* find(std::string_view key) const;

private:
    struct Slot {
        std::uint32_t hash = 0;
        std::uint32_t entry = none;
    };
    static constexpr std::uint32_t none = 0xFFFFFFFFU;

    static std::uint32_t hashOf(std::string_view key);
    std::size_t slotOf(std::string_view key, std::uint32_t hash) const;
    void grow();

    std::vector<KeyEntry> m_entries;
    std::vector<Slot> m_slots;  ///< a power of two of them, at most half of them taken
};

}  // namespace DeviceProfile
