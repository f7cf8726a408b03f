#include "platform/DeviceInstaller.h"

namespace platform {
namespace {

DeviceInstaller* replacement = nullptr;

}  // namespace

DeviceInstaller* deviceInstaller() {
    return replacement != nullptr ? replacement : realDeviceInstaller();
}

void replaceDeviceInstaller(DeviceInstaller* installer) {
    replacement = installer;
}

}  // namespace platform
