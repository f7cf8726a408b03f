// The ports of a host that keeps its devices in an installer.
#pragma once

#include "platform/HostPorts.h"

namespace platform {

/// The present devices of the Ports class, in the installer's order.
HostPortList installedPorts(DeviceInstaller& installer);

}  // namespace platform
