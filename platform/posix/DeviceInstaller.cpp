#include "platform/DeviceInstaller.h"

namespace platform {

/// The kernel binds drivers by itself: nothing here registers, updates or removes devices for a program.
DeviceInstaller* realDeviceInstaller() {
    return nullptr;
}

}  // namespace platform
