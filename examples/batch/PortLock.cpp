#include "PortLock.h"

#include <algorithm>
#include <cstdint>

namespace {

/// A port id of its own for each address, above those of all real ports.
int deviceId(const std::string& address) {
    std::uint32_t hash = 2166136261;
    for (const char ch : address) {
        hash = (hash ^ static_cast<unsigned char>(ch)) * 16777619;
    }
    return 1000000 + static_cast<int>(hash % 1000000000);
}

}  // namespace

bool PortLock::take(const char* displayName) {
    giveBack();
    const char* const genericName = CableInfo::getPortGenericName(displayName);
    if (genericName == nullptr) {
        m_failure = "there is no such port";
        return false;
    }
    const int number = std::max(CableInfo::getPortNumber(displayName), 0);
    return attach(Access::generatePortId(genericName, number, Access::SHARE),
                  Access::generatePortId(genericName, number, Access::COUNT));
}

bool PortLock::takeDevice(const std::string& address) {
    giveBack();
    return attach(deviceId(address), deviceId(address));  // the two kinds have names of their own
}

/// Counts itself in, then takes the port; counts itself out again where another one has it.
bool PortLock::attach(int holderId, int counterId) {
    m_counter = std::make_unique<Access>(counterId, Access::COUNT);
    if (m_counter->decCount() == 0) {
        m_counter.reset();
        m_failure = "all places at the port are taken";
        return false;
    }
    m_holder = std::make_unique<Access>(holderId, Access::SHARE);
    if (m_holder->lock()) {
        return true;
    }
    const int others = m_counter->getNormalizedCount() - 1;
    giveBack();
    m_failure = "the port is in use by another process; " + std::to_string(others) +
                (others == 1 ? " other client is attached" : " other clients are attached");
    return false;
}

void PortLock::giveBack() {
    m_holder.reset();  // releases what it holds
    if (m_counter != nullptr) {
        m_counter->incCount();
        m_counter.reset();
    }
}
