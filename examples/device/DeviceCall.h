// What the simulated device was called with.
#pragma once

#include <optional>
#include <string>

#include "DeviceLink.h"
#include "SimulatedChain.h"

struct DeviceCall {
    std::optional<DeviceAddress> address;  ///< nothing where the call does not fit
    bool isHelp = false;
    bool isQuit = false;      ///< end the device that serves there
    std::string contentFile;  ///< empty for none
    Faults faults;
};

/// Reads the command line. What does not fit is reported.
DeviceCall readDeviceCall(int argc, char** argv);

/// How the program is called, in many lines.
std::string deviceCallHelp();
