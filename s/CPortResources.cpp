#include "CPortResources.h"

#include <cstdint>
#include <cstdio>
#include <cstring>
#include <string>

#include "HkMessageManager.h"
#include "HkStr.h"
#include "PortRecords.h"
#include "platform/HostPorts.h"

namespace {

constexpr std::size_t nameLength = 4;
char nameBuffer[nameLength + 1];

std::string& hostRoot() {
    static std::string& root = *new std::string;
    return root;
}

int low32Bits(std::uint64_t address) {
    return static_cast<int>(static_cast<std::uint32_t>(address));
}

/// The first two ranges have fields of their own; from the third on they go in turn to the same fields.
void storeRanges(const std::vector<platform::IoRange>& ranges, PortResource& record) {
    bool isBase = true;
    for (const platform::IoRange& range : ranges) {
        if (isBase) {
            record.setBaseStartAddress(low32Bits(range.start));
            record.setBaseEndAddress(low32Bits(range.end));
        } else {
            record.setEcpStartAddress(low32Bits(range.start));
            record.setEcpEndAddress(low32Bits(range.end));
        }
        isBase = !isBase;
    }
}

void reportRanges(const platform::HostPort& port) {
    if (port.rangeResult == platform::RangeResult::Unknown) {
        HkMessageManager::debugStub("SetupDiGetDeviceInfoListDetail () error = %ld, 0x%08lX.\n",
                                    static_cast<long>(static_cast<std::int32_t>(port.error)),
                                    static_cast<unsigned long>(port.error));
    } else if (port.rangeResult == platform::RangeResult::None) {
        std::printf("No resources.\n");
    }
}

void appendCopy(const PortResource& port, std::list<PortResource*>& ports) {
    ports.push_back(nullptr);
    ports.back() = new PortResource(port);
}

void appendUsbPorts(std::list<PortResource*>& ports) {
    for (const char* const name : {"usb1", "usb2", "usb3", "usb4"}) {
        PortResource port;
        port.setPortName(name);
        appendCopy(port, ports);
    }
}

bool isEither(const char* text, const char* a, const char* b) {
    return HkStr::ICompare(text, a) == 0 || HkStr::ICompare(text, b) == 0;
}

}  // namespace

CPortResources* CPortResources::m_instance = nullptr;

CPortResources* CPortResources::Instance() {
    if (m_instance == nullptr) {
        m_instance = new CPortResources;
    }
    return m_instance;
}

CPortResources::CPortResources() {
    populatePortList();
}

CPortResources::CPortResources(const CPortResources& other) : m_ports(other.m_ports) {
    PortRecords::all().share(m_ports);
}

CPortResources& CPortResources::operator=(const CPortResources& other) {
    if (this != &other) {
        std::list<PortResource*> ports = other.m_ports;
        PortRecords::all().share(ports);
        PortRecords::all().leave(m_ports);
        m_ports.swap(ports);
    }
    return *this;
}

CPortResources::~CPortResources() {
    if (m_instance == this) {
        m_instance = nullptr;
        PortRecords::all().release(m_ports);
    } else {
        removeInstance();
        PortRecords::all().leave(m_ports);
    }
}

void CPortResources::removeInstance() {
    if (m_instance != nullptr) {
        PortRecords::all().release(m_ports);
        delete m_instance;
    }
}

void CPortResources::populatePortList() {
    const platform::HostPortList host = platform::hostPorts().list(hostRoot());
    if (host.failedCall != nullptr) {
        std::printf("%s failed: %lx.\n", host.failedCall, static_cast<unsigned long>(host.error));
    }
    for (const platform::HostPort& port : host.ports) {
        if (port.hasText) {
            PortResource& record = PortRecords::all().append(m_ports);
            record.setPortDisplayName(port.text.c_str());
            record.setPortName(extractPortName(port.text.c_str()));
            storeRanges(port.ranges, record);
        }
        reportRanges(port);
    }
}

bool CPortResources::getPortResources(const char* portType, std::list<PortResource*>& ports) {
    if (isEither(portType, "USB", "USB2")) {
        appendUsbPorts(ports);
        return true;
    }
    if (!isEither(portType, "LPT", "COM")) {
        return false;
    }
    for (const PortResource* const port : m_ports) {
        if (HkStr::INCompare(port->getPortName(), portType, std::strlen(portType)) == 0) {
            appendCopy(*port, ports);
        }
    }
    return true;
}

PortResource* CPortResources::getPortResource(const char* portName) {
    for (PortResource* const port : m_ports) {
        if (HkStr::ICompare(port->getPortName(), portName) == 0) {
            return port;
        }
    }
    return nullptr;
}

void CPortResources::deletePortResources(std::list<PortResource*>& ports) {
    for (PortResource* const port : ports) {
        if (!PortRecords::all().isListed(port)) {
            delete port;
        }
    }
    ports.clear();
}

char* CPortResources::extractPortName(const char* text) {
    const char* marker = nullptr;
    for (const char* const wanted : {"(LPT", "(COM"}) {
        marker = HkStr::FindString(text, wanted);
        if (marker != nullptr) {
            break;
        }
    }
    char name[sizeof nameBuffer] = "";  // the text may be in the buffer
    HkStr::NCopy(name, marker != nullptr ? marker + 1 : "(COM", nameLength);
    return HkStr::Copy(nameBuffer, name);
}

void CPortResources::setHostRoot(const char* directory) {
    hostRoot() = HkStr::View(directory);
    while (!hostRoot().empty() && hostRoot().back() == '/') {
        hostRoot().pop_back();
    }
}
