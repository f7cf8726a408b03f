#include "PortRecords.h"

#include <memory>

PortRecords& PortRecords::all() {
    static PortRecords& records = *new PortRecords;
    return records;
}

PortResource& PortRecords::append(List& ports) {
    auto record = std::make_unique<PortResource>();
    ports.push_back(record.get());
    try {
        m_lists[record.get()] = 1;
    } catch (...) {
        ports.pop_back();
        throw;
    }
    return *record.release();
}

void PortRecords::share(const List& ports) {
    for (PortResource* const port : ports) {
        ++m_lists[port];
    }
}

void PortRecords::release(List& ports) {
    for (PortResource* const port : ports) {
        const auto entry = m_lists.find(port);
        if (--entry->second == 0) {
            m_lists.erase(entry);
            delete port;
        }
    }
    ports.clear();
}

void PortRecords::leave(List& ports) {
    for (PortResource* const port : ports) {
        --m_lists[port];
    }
    ports.clear();
}
