/// @file
/// The record of one cable connection, and the conversions of port names and speeds.
#pragma once

#include "HkString.h"
#include "NetString.h"

/// One cable connection: the port it sits on, the cable, and the server that offers it.
///
/// The record also converts between the forms of a port, the generic name ("LPT"), the zero-based number (0) and the
/// display name ("LPT1"), and of a speed, the number in hertz (5000000), its digits ("5000000") and the display text
/// ("5 MHz"). No operation throws; what cannot be converted is reported and answered by null or -1.
///
/// Every text that a getter gives stays owned by the record, or is a constant, and nothing is to be freed. It stays
/// good until that field changes. Texts given to setters are copied; null counts as the empty text.
class TESSAL_API CableInfo : public Streamable {
public:
    /// What kind of connection a record describes.
    enum CableType {
        CABLE_NONE = 0,        ///< not decided: the port name tells nothing
        CABLE_USB = 1,         ///< port name "USB"
        CABLE_COM = 2,         ///< port name "COM"
        CABLE_LPT = 3,         ///< port name "LPT"
        CABLE_NULL = 4,        ///< port name "NULL"
        CABLE_SVF = 5,         ///< a file "*.svf" or "*.zsvf"
        CABLE_STAPL = 6,       ///< a file "*.stapl"
        CABLE_USB2 = 7,        ///< port name "USB2", neither flag set
        CABLE_USB2_FLAG4 = 8,  ///< port name "USB2", flag value 4 set and 8 clear
        CABLE_USB2_FLAG8 = 9   ///< port name "USB2", flag value 8 set
    };

    CableInfo();

    /// Reads port name, number, speed and cable name; all else stays, the decided type and the cached texts too. A
    /// field that is not there keeps its value and leaves the stream in its fail state.
    void readStream(std::istream& in) override;
    /// Writes port name, number, speed and cable name: six lines. The two texts must not hold white space.
    void writeStream(std::ostream& out) override;

    char* getPortName() { return m_portName.getString(); }
    /// Sets the generic port name or, for a vector output, the file name; the type is decided anew.
    void setPortName(const char* name);

    /// Zero-based port number; negative for none.
    int getPortNumber() { return m_portNumber; }
    void setPortNumber(int number) { m_portNumber = number; }

    /// Speed in hertz; the setter takes any number.
    int getPortSpeed() { return m_portSpeed; }
    void setPortSpeed(int speed) { m_portSpeed = speed; }

    char* getCableName() { return m_cableName.getString(); }
    void setCableName(const char* name);
    /// The same text as getCableName().
    const char* getDisplayCableName() { return m_cableName.getString(); }
    /// The cable name without blanks, tabs and line ends.
    const char* getCableNameWithoutSpace();

    /// Electronic serial number.
    char* getESN() { return m_esn.getString(); }
    void setESN(const char* esn) { m_esn.setString(esn); }
    char* getAlias() { return m_alias.getString(); }
    void setAlias(const char* alias) { m_alias.setString(alias); }
    char* getServerName() { return m_serverName.getString(); }
    void setServerName(const char* name) { m_serverName.setString(name); }

    /// Flag bits; those of value 4 and 8 tell kinds of "USB2" cables apart. A type once decided is not changed by them.
    unsigned int getFlags() { return m_flags; }
    void setFlags(unsigned int flags) { m_flags = flags; }
    bool isConnected() { return m_connected; }

    /// Decides the type from port name and flags at the first call that can, and keeps it until setPortName().
    CableType getCableType();
    /// The port as a user knows it, such as "LPT1"; valid until the next call.
    const char* getDisplayPortName();

    /// The two texts of the record's speed; null, with a message, for a speed outside the table.
    const char* getSpeedString() { return getSpeedString(m_portSpeed); }
    const char* getDisplaySpeedString() { return getDisplaySpeedString(m_portSpeed); }

    /// Prints the record as status messages, one line each.
    void dump();

    /// The digits or the display text of a speed in hertz; null, with a message, for a speed outside the table.
    static const char* getSpeedString(int speed);
    static const char* getDisplaySpeedString(int speed);
    /// The speed of either text, without regard to case; -1, with a message, for any other text.
    static int getSpeedNumber(const char* text);
    /// Removes blanks, tabs and line ends in place; gives its argument.
    static char* removeSpace(char* text);
    /// Does the same as removeSpace(): it works in the caller's buffer, which must be writable in spite of the const.
    static const char* getCableNameWithoutSpace(const char* text);
    /// "COM", "USB", "USB2", "LPT", "SVF" or "STAPL" for a display or device name; null, with a message, for any other.
    static const char* getPortGenericName(const char* name);
    /// The zero-based port number in a display or device name; -1 where there is none, with a message where the name
    /// is not known.
    static int getPortNumber(const char* name);

private:
    HkString displayPortName();

    int m_portNumber = -1;
    int m_portSpeed = 0;
    NetString m_portName;
    NetString m_cableName;
    NetString m_esn;
    NetString m_alias;
    NetString m_serverName;
    CableType m_cableType = CABLE_NONE;
    bool m_connected = false;
    HkString m_cableNameNoSpace;
    HkString m_displayPortName;
    unsigned int m_flags = 0;
};
