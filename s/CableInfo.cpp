#include "CableInfo.h"

#include <istream>
#include <memory>
#include <ostream>

#include "HkPath.h"
#include "HkStr.h"
#include "s/CableInfoOrigin.h"
#include "s/RecordReader.h"
#include "s/RecordWriter.h"

namespace {

constexpr unsigned int flag4 = 4;
constexpr unsigned int flag8 = 8;

bool isSame(const char* a, const char* b) {
    return HkStr::ICompare(a, b) == 0;
}

bool contains(const char* text, const char* wanted) {
    return HkStr::FindString(text, wanted) != nullptr;
}

bool hasText(const char* text) {
    return HkStr::Len(text) != 0;
}

HkString numbered(const char* name, const HkString& number) {
    HkString result(name);
    result += number;
    return result;
}

struct TypeOfName {
    const char* name;
    CableInfo::CableType type;
};

constexpr TypeOfName typesOfExtensions[] = {
    {"svf", CableInfo::CABLE_SVF},
    {"zsvf", CableInfo::CABLE_SVF},
    {"stapl", CableInfo::CABLE_STAPL},
};

constexpr TypeOfName typesOfPorts[] = {
    {"USB2", CableInfo::CABLE_USB2}, {"USB", CableInfo::CABLE_USB},   {"COM", CableInfo::CABLE_COM},
    {"LPT", CableInfo::CABLE_LPT},   {"NULL", CableInfo::CABLE_NULL},
};

template <std::size_t size>
CableInfo::CableType findType(const TypeOfName (&table)[size], const char* name) {
    for (const TypeOfName& row : table) {
        if (isSame(row.name, name)) {
            return row.type;
        }
    }
    return CableInfo::CABLE_NONE;
}

CableInfo::CableType typeOfPort(const char* portName, unsigned int flags) {
    const CableInfo::CableType type = findType(typesOfPorts, portName);
    if (type != CableInfo::CABLE_USB2) {
        return type;
    }
    return (flags & flag8) != 0   ? CableInfo::CABLE_USB2_FLAG8
           : (flags & flag4) != 0 ? CableInfo::CABLE_USB2_FLAG4
                                  : CableInfo::CABLE_USB2;
}

/// The name of a serial port: by its kind on this or that host; the former text where the port name is of none.
HkString serialDisplayName(const char* portName, int number, const HkString& plain, const HkString& counted,
                           const HkString& former) {
    if (HkStr::INCompare(portName, "COM", 3) == 0) {
        return numbered("COM", counted);
    }
    if (contains(portName, "ttyS")) {
        return numbered("ttyS", plain);
    }
    if (contains(portName, "tty")) {
        return number == 0 ? "ttya" : "ttyb";
    }
    return former;
}

}  // namespace

CableInfo::CableInfo() {
    for (NetString* text : {&m_portName, &m_cableName, &m_esn, &m_alias, &m_serverName}) {
        text->setString("");
    }
}

void CableInfo::readStream(std::istream& in) {
    RecordReader record(in);
    m_portName.read(record);
    record.readInt(m_portNumber);
    record.readInt(m_portSpeed);
    m_cableName.read(record);
}

void CableInfo::writeStream(std::ostream& out) {
    RecordWriter record(out);
    record.addText(m_portName.getString());
    record.addInt(m_portNumber);
    record.addInt(m_portSpeed);
    record.addText(m_cableName.getString());
    record.finish();
}

void CableInfo::setPortName(const char* name) {
    m_portName.setString(name);
    m_cableType = CABLE_NONE;
}

void CableInfo::setCableName(const char* name) {
    m_cableName.setString(name);
    m_cableNameNoSpace.Empty();
}

const char* CableInfo::getCableNameWithoutSpace() {
    if (m_cableNameNoSpace.IsEmpty()) {
        const std::unique_ptr<char[]> copy(HkStr::Dup(m_cableName.getString()));
        m_cableNameNoSpace = removeSpace(copy.get());
    }
    return m_cableNameNoSpace;
}

CableInfo::CableType CableInfo::getCableType() {
    if (m_cableType != CABLE_NONE || !hasText(m_portName.getString())) {
        return m_cableType;
    }
    const char* const portName = m_portName.getString();
    const char* const extension = HkPath::GetExt(portName, nullptr);
    m_cableType = hasText(extension) ? findType(typesOfExtensions, extension) : typeOfPort(portName, m_flags);
    return m_cableType;
}

const char* CableInfo::getDisplayPortName() {
    m_displayPortName = displayPortName();
    return m_displayPortName;
}

HkString CableInfo::displayPortName() {
    HkString plain;
    HkString counted;
    if (m_portNumber >= 0) {
        plain.Format("%d", m_portNumber);
        counted.Format("%u", static_cast<unsigned int>(m_portNumber) + 1);
    }
    const char* const portName = m_portName.getString();
    switch (getCableType()) {
        case CABLE_USB:
            return numbered("USB", counted);
        case CABLE_USB2:
            return numbered("USB2", counted);
        case CABLE_COM:
            return serialDisplayName(portName, m_portNumber, plain, counted, m_displayPortName);
        case CABLE_LPT:
            return contains(portName, "parport") ? numbered("parport", plain) : numbered("LPT", counted);
        case CABLE_SVF:
            return "SVF";
        case CABLE_STAPL:
            return "STAPL";
        case CABLE_NONE:
        case CABLE_NULL:
        case CABLE_USB2_FLAG4:
        case CABLE_USB2_FLAG8:
            break;
    }
    return "NULL";
}

void CableInfo::dump() {
    cableInfoOrigin.report().issueStatus("------------------------------------------\n");
    if (!hasText(m_cableName.getString())) {
        return;
    }
    const bool hasPort = hasText(m_portName.getString());
    cableInfoOrigin.report().issueStatus("Cable Name: %s\n", getCableName());
    if (hasPort) {
        cableInfoOrigin.report().issueStatus("Port Name: %s\n", getPortName());
    }
    cableInfoOrigin.report().issueStatus("Port Number: %d\n", m_portNumber);
    cableInfoOrigin.report().issueStatus("Port Speed: %d\n", m_portSpeed);
    cableInfoOrigin.report().issueStatus("Display Cable Name: %s\n", getDisplayCableName());
    cableInfoOrigin.report().issueStatus("Cable Name w/o space: %s\n", getCableNameWithoutSpace());
    const auto shown = [](const char* speed) { return speed != nullptr ? speed : "unknown"; };
    const char* const displaySpeed = getDisplaySpeedString();
    cableInfoOrigin.report().issueStatus("Display Port Speed: %s\n", shown(displaySpeed));
    const char* const speedDigits = getSpeedString();
    cableInfoOrigin.report().issueStatus("Port Speed string: %s\n", shown(speedDigits));
    if (hasPort) {
        cableInfoOrigin.report().issueStatus("Display Port Name: %s\n", getDisplayPortName());
    }
}
