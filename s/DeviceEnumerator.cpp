#include "DeviceEnumerator.h"

#include <algorithm>
#include <array>
#include <iterator>
#include <new>
#include <optional>

#include "HkStr.h"

namespace {

using platform::DeviceClass;
using platform::DeviceInstaller;
using platform::DeviceProperty;
using platform::DeviceRecord;
using platform::DeviceSet;

class Enumerator {
public:
    Enumerator(DeviceInstaller& installer, std::uint32_t flags) : m_installer(installer), m_flags(flags) {}

    int run(const std::vector<const char*>& patterns, const DeviceCallback& callback) {
        auto pattern = patterns.begin();
        if (pattern != patterns.end() && (*pattern)[0] == '=' && (*pattern)[1] != '\0') {
            std::uint32_t count = 0;
            if (!findClass(*pattern + 1, count)) {
                return driverFailed;
            }
            if (count == 0) {
                return driverDone;
            }
            ++pattern;
        }
        if (pattern != patterns.end() && HkStr::View(*pattern) == "*") {
            m_wantsAll = true;
            ++pattern;
        }
        m_wantsAll = m_wantsAll || pattern == patterns.end();
        std::transform(pattern, patterns.end(), std::back_inserter(m_patterns), &parseDeviceIdPattern);
        return walk(DeviceSet(m_installer, openSet()), callback);
    }

private:
    /// A name of more than one class is no failure: the first one counts.
    bool findClass(const char* name, std::uint32_t& count) {
        m_class.emplace();
        return m_installer.classOfName(name, *m_class, count) || m_installer.lastError() == platform::bufferTooSmall;
    }

    /// False when each pattern names its one device.
    bool needsSearch() const {
        return std::any_of(m_patterns.begin(), m_patterns.end(), [](const DeviceIdPattern& pattern) {
            return pattern.m_firstWildcard != nullptr || pattern.m_isInstanceId == 0;
        });
    }

    platform::DeviceSetHandle openSet() {
        const DeviceClass* const deviceClass = m_class ? &*m_class : nullptr;
        if (!needsSearch() && !m_wantsAll) {
            return m_installer.createSetOnMachine(deviceClass);
        }
        const std::uint32_t allClasses = m_class ? 0U : std::uint32_t{platform::devicesOfAllClasses};
        return m_installer.presentDevices(deviceClass, m_flags | allClasses, platform::noDeviceSet);
    }

    int walk(const DeviceSet& set, const DeviceCallback& callback) {
        if (!set.isOpen()) {
            return driverFailed;
        }
        for (const DeviceIdPattern& pattern : m_patterns) {
            if (pattern.m_isInstanceId != 0) {
                m_installer.openDevice(set.handle(), pattern.m_text);
            }
        }
        if (!m_installer.setDetail(set.handle(), m_machine)) {
            return driverFailed;
        }
        const bool isSearch = needsSearch() && !m_wantsAll;
        DeviceRecord device;
        for (std::uint32_t i = 0; set.deviceAt(i, device); ++i) {
            if (!isSearch || isWanted(set, device)) {
                if (const int result = callback(set, device, i)) {
                    return result;
                }
            }
        }
        return driverDone;
    }

    bool isWanted(const DeviceSet& set, const DeviceRecord& device) {
        return std::any_of(m_patterns.begin(), m_patterns.end(), [&](const DeviceIdPattern& pattern) {
            if (pattern.m_isInstanceId != 0) {
                return matchDeviceId(instanceId(device).c_str(), pattern);
            }
            return hasId(set, device, DeviceProperty::HardwareIds, pattern) ||
                   hasId(set, device, DeviceProperty::CompatibleIds, pattern);
        });
    }

    /// Empty where the host does not give it.
    std::string instanceId(const DeviceRecord& device) {
        constexpr std::uint32_t size = 200;
        std::array<char, size + 1> id{};
        return m_installer.instanceId(device, id.data(), size, m_machine) ? id.data() : "";
    }

    static bool hasId(const DeviceSet& set, const DeviceRecord& device, DeviceProperty property,
                      const DeviceIdPattern& pattern) {
        const std::vector<std::string> ids = set.list(device, property);
        return std::any_of(ids.begin(), ids.end(),
                           [&](const std::string& id) { return matchDeviceId(id.c_str(), pattern); });
    }

    DeviceInstaller& m_installer;
    std::uint32_t m_flags;
    std::vector<DeviceIdPattern> m_patterns;
    std::optional<DeviceClass> m_class;
    bool m_wantsAll = false;
    platform::Machine m_machine = nullptr;
};

}  // namespace

int enumerateDevices(DeviceInstaller& installer, std::uint32_t flags, const std::vector<const char*>& patterns,
                     const DeviceCallback& callback) {
    try {
        return Enumerator(installer, flags).run(patterns, callback);
    } catch (const std::bad_alloc&) {
        return driverFailed;
    }
}
