// The port records that objects list. Several objects may list one record, and each may be gone first.
#pragma once

#include <list>
#include <map>

#include "PortResource.h"

class PortRecords {
public:
    using List = std::list<PortResource*>;

    /// The records of the process. Never destroyed, so that it serves other units before and behind main.
    static PortRecords& all();

    /// A new record at the end of the list.
    PortResource& append(List& ports);
    /// One more object lists these.
    void share(const List& ports);
    /// Empties the list. A record that no other one holds is deleted, or else stays.
    void release(List& ports);
    void leave(List& ports);

    /// True for a record that append() made and release() has not deleted.
    bool isListed(PortResource* port) const { return m_lists.count(port) != 0; }

private:
    /// Number of lists that hold a record; 0 for one that was left.
    std::map<PortResource*, int> m_lists;
};
