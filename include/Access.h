/// @file
/// The locks by which the tool processes of one machine share a port.
#pragma once

#include "TessalExport.h"

struct PlatformSemaphore;

/// One handle on a machine-wide named semaphore of a port: the binary one that a process holds while it drives the
/// cable, or the counting one that tells how many clients are attached to it.
///
/// No operation waits for the port: a caller learns at once that it is busy. None throws. The semaphore comes to be
/// with the first Access on it and is gone with the last one, also when a process is killed; then the next Access
/// starts over with all units. While another Access lives, the count stays as a dead process left it, and cleanLock()
/// or incCount() gives the lost unit back. A unit has no owner.
///
/// An object belongs to one thread at a time. In a child that was forked, the parent's objects are inert: they take
/// and release nothing, and destroying them does nothing to the port. See docs/sharing.md for what is promised.
///
///     Access port(Access::generatePortId("USB", 0, Access::SHARE), Access::SHARE);
///     if (port.lock()) { ... port.unlock(); }
class TESSAL_API Access {
public:
    /// Kind of the semaphore.
    enum ACCESS_TYPE : int {
        SHARE = 0,  ///< "CableSharing<id>", 1 unit: who holds it drives the cable
        COUNT = 1   ///< "CableShareCount<id>", 5 units: the free client slots
    };

    /// Opens the semaphore of the port, or creates it with all its units. @p portId is of generatePortId() with the
    /// same type. If neither succeeds, the object stands without a semaphore, an info message says why, and every
    /// later operation fails. Blocks for some seconds at most, and only while a process stands still inside its own
    /// opening or closing of the same semaphore.
    Access(int portId, ACCESS_TYPE type);

    /// A second, independent handle on the semaphore of @p other. It holds no unit, whatever the other holds.
    Access(const Access& other);
    /// Takes over the handle and the held unit; @p other stands without a semaphore.
    Access(Access&& other) noexcept;
    /// As destroying this object and copying the other.
    Access& operator=(const Access& other);
    /// As destroying this object and moving the other.
    Access& operator=(Access&& other) noexcept;

    /// Gives the held unit of a SHARE back, not that of a COUNT, and closes the handle.
    ~Access();

    /// Takes a unit if one is there: true if taken. If none is taken, this object no longer counts as holding one,
    /// even where an earlier call took it.
    bool lock();

    /// Gives back the unit that this object holds: true if given back. False at once if it holds none; false with a
    /// status message if the semaphore refuses.
    bool unlock();

    /// Gives a unit back, whoever took it: the way to free a port whose holder has died. False with a status message
    /// if none is taken.
    bool cleanLock();

    /// Gives a client slot back: the number of free slots then, or 0 with a status message if all are free.
    int incCount();

    /// Takes a client slot: 1, or 0 if none is free.
    int decCount();

    /// The number of attached clients, 0 to 5; 5 without a semaphore.
    int getNormalizedCount();

    /// The id of port number @p port, 0 to 19, of the family @p portName in any case: "LPT" 120 + port, "USB"
    /// 140 + port, "USB2" 160 + port, "COM" 180 + port, and 900 more for a COUNT. 100 or 1000 for any other name.
    /// Numbers outside 0 to 19 give ids of other families.
    static int generatePortId(const char* portName, int port, ACCESS_TYPE type);

private:
    bool take();
    bool giveBack();

    PlatformSemaphore* m_semaphore;  ///< null if there is none
    bool m_held;                     ///< a unit taken by this object and not yet given back
    ACCESS_TYPE m_type;
};
