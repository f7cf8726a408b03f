/// @file
/// The serial and parallel ports of the host.
#pragma once

#include <list>

#include "PortResource.h"
#include "TessalExport.h"

/// The ports that the host had when the object was made, in the host's order. A port that comes up later needs
/// removeInstance() and a new Instance(). See docs/ports.md for where the host's ports come from.
///
/// Nothing is thrown but std::bad_alloc. What the host does not give is printed on standard output, and the list is
/// shorter. Objects and static operations belong to one thread at a time.
///
///     std::list<PortResource*> ports;
///     CPortResources::Instance()->getPortResources("LPT", ports);
///     ...
///     CPortResources::Instance()->deletePortResources(ports);
class TESSAL_API CPortResources {
public:
    /// The object that the process shares, made at the first call.
    static CPortResources* Instance();

    /// An object of its own; it asks the host too.
    CPortResources();
    /// Lists the same records as @p other, not copies of them. A record lives at least as long as an object lists it.
    CPortResources(const CPortResources& other);
    CPortResources& operator=(const CPortResources& other);
    /// As removeInstance(). Where no shared object is there, the records that this one listed stay.
    ~CPortResources();

    /// Where the shared object is there, destroys it and gives up the records of this object, which then lists none.
    /// Called through Instance() it ends the object that it is called for.
    void removeInstance();

    /// Appends copies of the ports of a family to @p ports; they belong to the caller, who gives them back through
    /// deletePortResources().
    /// @param portType in any case: "LPT" or "COM" for the listed ports whose short names begin so, "USB" or "USB2"
    /// for four records named "usb1" to "usb4" on any host
    /// @return false for another type, which appends nothing
    bool getPortResources(const char* portType, std::list<PortResource*>& ports);

    /// The first listed record with that short name in any case, or null. It stays this object's own.
    PortResource* getPortResource(const char* portName);

    /// Deletes the records and empties the list. Records that are listed by an object are left alone.
    void deletePortResources(std::list<PortResource*>& ports);

    /// The four characters behind the first "(" of a "(LPT", or else of a "(COM", in the text: "COM3", and "COM1" also
    /// for "(COM12)". The text "(COM" where neither is there. The result is in a buffer that all calls share.
    static char* extractPortName(const char* text);

    /// Names the directory that stands for "/" when a Linux host's ports are looked for, for objects that are made
    /// later; null for "/" itself. Without effect on Windows.
    static void setHostRoot(const char* directory);

private:
    void populatePortList();

    std::list<PortResource*> m_ports;
    static CPortResources* m_instance;
};
