// The serial and parallel ports that the host has, in the order in which it gives them.
//
// A port's text names it for the user and holds "(COM" or "(LPT" and a number. On Windows the ports are the present
// devices of the Ports class; the text is the device's own, so a device of the class may have another one. On Linux
// they are what the kernel shows below /sys and /proc: each serial port with hardware behind it, each USB serial port,
// each parallel port; the text names the device node.
//
// Listing blocks while the host is asked, changes nothing, and is meant for one thread at a time.
#pragma once

#include <cstdint>
#include <string>
#include <vector>

#include "platform/DeviceInstaller.h"

namespace platform {

enum class RangeResult {
    Known,   ///< the ranges are all that there are
    None,    ///< the host has set up no resources for the device
    Unknown  ///< the host did not tell
};

struct HostPort {
    std::string text;
    std::vector<IoRange> ranges;
    RangeResult rangeResult = RangeResult::Known;
    std::uint32_t error = 0;  ///< the host's number, where the ranges are unknown
    bool hasText = true;      ///< false: the device is no port for the user
};

struct HostPortList {
    std::vector<HostPort> ports;
    const char* failedCall = nullptr;  ///< the host's call without which there is no list
    std::uint32_t error = 0;           ///< the host's number for that failure
};

class HostPorts {
public:
    virtual ~HostPorts() = default;
    /// @param root the directory that stands for "/", without a "/" at its end, where the host has such a tree
    virtual HostPortList list(const std::string& root) = 0;
};

/// The one in use.
HostPorts& hostPorts();
/// Puts another one in its place; null restores the host's own.
void replaceHostPorts(HostPorts* ports);

/// The host's own.
HostPorts& realHostPorts();

}  // namespace platform
