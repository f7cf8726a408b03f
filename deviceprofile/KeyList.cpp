#include "deviceprofile/KeyList.h"

#include <functional>

#include "deviceprofile/LogicalLines.h"

namespace DeviceProfile {

/// The slot that holds the key, or the free one where it belongs.
std::size_t KeyList::slotOf(std::string_view key) const {
    const std::size_t mask = m_slots.size() - 1;
    std::size_t at = std::hash<std::string_view>()(key) & mask;
    while (m_slots[at].line != 0 && m_text + m_slots[at].place != key) {
        at = (at + 1) & mask;
    }
    return at;
}

void KeyList::grow() {
    constexpr std::size_t firstSize = 64;
    std::vector<Slot> former(m_slots.empty() ? firstSize : 2 * m_slots.size());
    former.swap(m_slots);
    for (const Slot& slot : former) {
        if (slot.line != 0) {
            m_slots[slotOf(m_text + slot.place)] = slot;
        }
    }
}

std::uint32_t KeyList::set(const char* key, std::uint32_t line, const char* open) {
    if (2 * m_count >= m_slots.size()) {
        grow();
    }
    Slot& slot = m_slots[slotOf(key)];
    const std::uint32_t formerLine = slot.line;
    m_count += formerLine == 0 ? 1 : 0;
    const auto placeOf = [this](const char* text) { return static_cast<std::uint32_t>(text - m_text); };
    slot = Slot{placeOf(key), line, open != nullptr ? placeOf(open) : 0};
    return formerLine;
}

const char* KeyList::find(std::string_view key) {
    if (m_slots.empty()) {
        return nullptr;
    }
    Slot& slot = m_slots[slotOf(key)];
    if (slot.open != 0) {
        joinPieces(m_text + slot.place + key.size() + 1, m_text + slot.open);
        slot.open = 0;
    }
    return slot.line != 0 ? m_text + slot.place : nullptr;
}

}  // namespace DeviceProfile
