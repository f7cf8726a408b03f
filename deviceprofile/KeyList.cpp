#include "deviceprofile/KeyList.h"

#include <functional>

namespace DeviceProfile {

std::uint32_t KeyList::hashOf(std::string_view key) {
    return static_cast<std::uint32_t>(std::hash<std::string_view>()(key));
}

/// The slot that holds the key, or the free one where it belongs.
std::size_t KeyList::slotOf(std::string_view key, std::uint32_t hash) const {
    const std::size_t mask = m_slots.size() - 1;
    std::size_t at = hash & mask;
    while (m_slots[at].entry != none && (m_slots[at].hash != hash || m_entries[m_slots[at].entry].key != key)) {
        at = (at + 1) & mask;
    }
    return at;
}

void KeyList::grow() {
    constexpr std::size_t firstSize = 64;
    std::vector<Slot> former(m_slots.empty() ? firstSize : 2 * m_slots.size());
    former.swap(m_slots);
    const std::size_t mask = m_slots.size() - 1;
    for (const Slot& slot : former) {
        if (slot.entry != none) {
            std::size_t at = slot.hash & mask;
            while (m_slots[at].entry != none) {
                at = (at + 1) & mask;
            }
            m_slots[at] = slot;
        }
    }
}

std::uint32_t KeyList::set(const KeyEntry& entry) {
    if (2 * m_entries.size() >= m_slots.size()) {
        grow();
    }
    const std::uint32_t hash = hashOf(entry.key);
    Slot& slot = m_slots[slotOf(entry.key, hash)];
    if (slot.entry != none) {
        KeyEntry& former = m_entries[slot.entry];
        const std::uint32_t line = former.line;
        former = entry;
        return line;
    }
    slot = Slot{hash, static_cast<std::uint32_t>(m_entries.size())};
    m_entries.push_back(entry);
    return 0;
}

const KeyEntry* KeyList::find(std::string_view key) const {
    if (m_slots.empty()) {
        return nullptr;
    }
    const Slot& slot = m_slots[slotOf(key, hashOf(key))];
    return slot.entry != none ? &m_entries[slot.entry] : nullptr;
}

}  // namespace DeviceProfile
