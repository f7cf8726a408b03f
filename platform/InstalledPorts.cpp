#include "platform/InstalledPorts.h"

#include <optional>

#include "platform/DeviceSet.h"

namespace platform {
namespace {

/// Reads the I/O ranges that the host has given one device.
class RangeReader {
public:
    RangeReader(DeviceInstaller& installer, const DeviceRecord& device) : m_installer(installer), m_device(device) {}

    void readInto(HostPort& port, DeviceSetHandle set) {
        if (!m_installer.setDetail(set, m_machine) || !m_installer.status(m_device, m_machine, m_status, m_problem)) {
            port.rangeResult = RangeResult::Unknown;
            port.error = m_installer.lastError();
            return;
        }
        LogicalConfiguration configuration = 0;
        if (!pick(configuration)) {
            port.rangeResult = RangeResult::None;
            return;
        }
        walk(configuration, port.ranges);
        m_installer.freeConfiguration(configuration);
    }

private:
    bool has(ConfigurationKind kind, LogicalConfiguration& configuration) {
        return m_installer.configuration(m_device, kind, m_machine, configuration);
    }

    /// The configuration in force; of a device with a problem the one that it would have, unless it is disabled.
    bool pick(LogicalConfiguration& configuration) {
        const bool isTroubled = (m_status & hasProblem) != 0;
        if (!isTroubled && has(ConfigurationKind::Allocated, configuration)) {
            return true;
        }
        if (has(ConfigurationKind::Forced, configuration)) {
            return true;
        }
        const bool isDisabled = isTroubled && m_problem == problemHardwareDisabled;
        return !isDisabled && has(ConfigurationKind::Boot, configuration);
    }

    /// Each descriptor is kept until the one behind it is known.
    void walk(LogicalConfiguration configuration, std::vector<IoRange>& ranges) {
        constexpr int mostDescriptors = 1024;
        std::optional<ResourceDescriptor> current;
        for (int i = 0; i < mostDescriptors; ++i) {
            ResourceDescriptor next = 0;
            const bool isThere = m_installer.nextIoDescriptor(current.value_or(configuration), next);
            free(current);
            if (!isThere) {
                return;
            }
            current = next;
            IoRange range;
            if (m_installer.ioRange(next, range) && range.end - range.start + 1 != 0) {
                ranges.push_back(range);
            }
        }
        free(current);
    }

    void free(const std::optional<ResourceDescriptor>& descriptor) {
        if (descriptor) {
            m_installer.freeDescriptor(*descriptor);
        }
    }

    DeviceInstaller& m_installer;
    const DeviceRecord& m_device;
    Machine m_machine = nullptr;
    std::uint32_t m_status = 0;
    std::uint32_t m_problem = 0;
};

HostPort portOf(DeviceInstaller& installer, const DeviceSet& set, const DeviceRecord& device) {
    std::optional<std::string> text = set.text(device, DeviceProperty::FriendlyName);
    if (!text) {
        text = set.text(device, DeviceProperty::Description);
    }
    HostPort port;
    port.hasText = text.has_value();
    port.text = text.value_or("");
    RangeReader(installer, device).readInto(port, set.handle());
    return port;
}

}  // namespace

HostPortList installedPorts(DeviceInstaller& installer) {
    const ClassDevices devices(installer, portsClass);
    HostPortList list;
    list.failedCall = devices.failure().call;
    list.error = devices.failure().error;
    if (!devices.isOpen()) {
        return list;
    }
    DeviceRecord device;
    for (std::uint32_t i = 0; devices.devices().deviceAt(i, device); ++i) {
        list.ports.push_back(portOf(installer, devices.devices(), device));
    }
    return list;
}

}  // namespace platform
