/// @file
/// One serial or parallel port of the host.
#pragma once

#include "TessalExport.h"

/// The names and I/O address ranges of a port. Addresses are the low 32 bits of what the host gives, ends belong to
/// their range, and -1 means that the host gave none. A plain record: copies are independent.
class TESSAL_API PortResource {
public:
    PortResource() = default;

    /// Copies the host's name for the port, as far as 63 bytes go; null is the empty text.
    void setPortDisplayName(const char* name);
    /// Copies the short name, such as "LPT1", "COM3" or "usb1", as far as 15 bytes go; null is the empty text.
    void setPortName(const char* name);
    void setBaseStartAddress(int address) { m_baseStartAddress = address; }
    void setBaseEndAddress(int address) { m_baseEndAddress = address; }
    void setEcpStartAddress(int address) { m_ecpStartAddress = address; }
    void setEcpEndAddress(int address) { m_ecpEndAddress = address; }

    /// The names are the record's own.
    char* getPortDisplayName() { return m_portDisplayName; }
    const char* getPortDisplayName() const { return m_portDisplayName; }
    char* getPortName() { return m_portName; }
    const char* getPortName() const { return m_portName; }
    int getBaseStartAddress() const { return m_baseStartAddress; }
    int getBaseEndAddress() const { return m_baseEndAddress; }
    int getEcpStartAddress() const { return m_ecpStartAddress; }
    int getEcpEndAddress() const { return m_ecpEndAddress; }

private:
    char m_portDisplayName[64] = "";
    char m_portName[16] = "";
    int m_baseStartAddress = -1;
    int m_baseEndAddress = -1;
    int m_ecpStartAddress = -1;
    int m_ecpEndAddress = -1;
};
