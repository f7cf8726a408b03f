// The port of a cable, kept from other processes while this one uses it.
#pragma once

#include <TessalUtility.h>

#include <memory>
#include <string>

/// Takes a port by its two machine-wide semaphores: one that a single process holds, and one that counts who is
/// attached. Destroying it gives both back.
class PortLock {
public:
    PortLock() = default;
    PortLock(PortLock&&) = default;
    PortLock& operator=(PortLock&&) = delete;
    ~PortLock() { giveBack(); }

    // Each takes a port in place of the former one. False where all places at it are taken, or where another process
    // holds it; failure() then says which.

    /// Takes the port that the display name tells, such as "usb2" or "LPT1"; false also where it is none.
    bool take(const char* displayName);
    /// Takes the port that a simulated device is, by its address.
    bool takeDevice(const std::string& address);

    void giveBack();
    bool isTaken() const { return m_holder != nullptr; }

    const std::string& failure() const { return m_failure; }

private:
    bool attach(int holderId, int counterId);

    std::unique_ptr<Access> m_holder;
    std::unique_ptr<Access> m_counter;
    std::string m_failure;
};
