#include "PortLock.h"

#include <algorithm>

bool PortLock::take(const char* displayName) {
    giveBack();
    const char* const genericName = CableInfo::getPortGenericName(displayName);
    if (genericName == nullptr) {
        m_failure = "there is no such port";
        return false;
    }
    return attach(genericName, std::max(CableInfo::getPortNumber(displayName), 0));
}

/// Counts itself in, then takes the port; counts itself out again where another one has it.
bool PortLock::attach(const char* genericName, int number) {
    const auto semaphore = [=](Access::ACCESS_TYPE type) {
        return std::make_unique<Access>(Access::generatePortId(genericName, number, type), type);
    };
    m_counter = semaphore(Access::COUNT);
    if (m_counter->decCount() == 0) {
        m_counter.reset();
        m_failure = "all places at the port are taken";
        return false;
    }
    m_holder = semaphore(Access::SHARE);
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
