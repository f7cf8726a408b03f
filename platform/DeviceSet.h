// A set of the host's devices that is given back at the end, the walk over it, and its devices' properties.
#pragma once

#include <cstdint>
#include <optional>
#include <string>
#include <vector>

#include "platform/DeviceInstaller.h"

namespace platform {

class DeviceSet {
public:
    DeviceSet(DeviceInstaller& installer, DeviceSetHandle handle) : m_installer(installer), m_handle(handle) {}
    ~DeviceSet() {
        if (isOpen()) {
            m_installer.destroySet(m_handle);
        }
    }
    DeviceSet(const DeviceSet&) = delete;
    DeviceSet& operator=(const DeviceSet&) = delete;

    bool isOpen() const { return m_handle != noDeviceSet; }
    DeviceSetHandle handle() const { return m_handle; }

    /// Puts the device at an index from 0 out; false past the last. A host that never comes to an end is stopped.
    bool deviceAt(std::uint32_t index, DeviceRecord& device) const {
        constexpr std::uint32_t mostDevices = 1U << 14;
        return index < mostDevices && m_installer.deviceAt(m_handle, index, device);
    }

    /// The value of a property that is a text; nothing when the host does not give it.
    std::optional<std::string> text(const DeviceRecord& device, DeviceProperty property) const;
    /// The texts of a property that is a list, up to the first empty one; none when the host does not give it.
    std::vector<std::string> list(const DeviceRecord& device, DeviceProperty property) const;

private:
    DeviceInstaller& m_installer;
    DeviceSetHandle m_handle;
};

/// Which call failed to give the devices of a class, and the host's number for it.
struct DeviceSetFailure {
    const char* call = nullptr;
    std::uint32_t error = 0;
};

/// The present devices of a class, made in two steps: an empty set, and the devices added to it.
class ClassDevices {
public:
    ClassDevices(DeviceInstaller& installer, const DeviceClass& deviceClass);

    bool isOpen() const { return m_failure.call == nullptr; }
    const DeviceSetFailure& failure() const { return m_failure; }
    const DeviceSet& devices() const { return m_set; }

private:
    DeviceSetFailure m_failure;
    DeviceSet m_set;
};

}  // namespace platform
