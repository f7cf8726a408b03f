// Calls back for each of the host's devices that patterns choose.
#pragma once

#include <cstdint>
#include <functional>
#include <string>
#include <vector>

#include "CableDriver.h"
#include "platform/DeviceSet.h"

/// What the driver operations give.
enum DriverResult : int { driverDone = 0, driverNeedsRestart = 1, driverFailed = 2 };

/// A result other than 0 ends the walk.
using DeviceCallback =
    std::function<int(const platform::DeviceSet& set, platform::DeviceRecord& device, std::uint32_t index)>;

/// Patterns are ids as parseDeviceIdPattern() takes them. The first one may be "=" and the name of a class, to which
/// the search then keeps; the next one, or the first, may be "*" for all devices, and so is no pattern at all.
/// @param flags which devices are searched: platform::DeviceFlag
/// @return what ended the walk, 0 at its end, driverFailed for a failure of the host or of memory
int enumerateDevices(platform::DeviceInstaller& installer, std::uint32_t flags,
                     const std::vector<const char*>& patterns, const DeviceCallback& callback);
