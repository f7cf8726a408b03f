#include "CableDriver.h"

#include <algorithm>
#include <array>
#include <cstdio>
#include <cstring>
#include <string>

#include "DeviceEnumerator.h"
#include "HkStr.h"
#include "platform/DeviceSet.h"

namespace {

using platform::DeviceClass;
using platform::DeviceInstaller;
using platform::DeviceRecord;
using platform::DeviceSet;
using platform::InstallFunction;

constexpr const char* cableDescriptions[] = {"Zarnex USB Cable", "Zarnex Hexlink Cable USB"};

bool isCable(const DeviceSet& set, const DeviceRecord& device) {
    const std::optional<std::string> text = set.text(device, platform::DeviceProperty::Description);
    return text && std::any_of(std::begin(cableDescriptions), std::end(cableDescriptions),
                               [&](const char* cable) { return HkStr::ICompare(text->c_str(), cable) == 0; });
}

/// Where the host has the call, it installs the driver on all devices of the id. What comes of it is not asked.
int updateCableDriver(DeviceInstaller& installer, const char* infPath, const char* hardwareId) {
    const platform::LibraryHandle library = installer.loadLibrary("newdev.dll");
    if (library == nullptr) {
        return driverDone;
    }
    if (const platform::UpdateEntry entry = installer.findEntry(library, "UpdateDriverForPlugAndPlayDevicesA")) {
        installer.updateDriver(entry, hardwareId, infPath);
    }
    installer.freeLibrary(library);
    return driverDone;
}

/// A list of one hardware id, of 255 characters at most, ended by an empty one.
class HardwareIdList {
public:
    explicit HardwareIdList(const char* hardwareId) { std::snprintf(m_list.data(), longest + 1, "%s", hardwareId); }
    const char* data() const { return m_list.data(); }
    std::uint32_t bytes() const { return static_cast<std::uint32_t>(std::strlen(m_list.data())) + 2; }

private:
    static constexpr std::size_t longest = 255;
    std::array<char, 260> m_list{};
};

/// Makes a device of the hardware id known to the host, and gives it the driver.
int installCableDriver(DeviceInstaller& installer, const char* infPath, const char* hardwareId) {
    constexpr std::uint32_t pathSize = 260;
    constexpr std::uint32_t nameSize = 32;
    std::array<char, pathSize> fullPath{};  // empty when the host cannot tell it: then it has no class
    if (installer.fullPath(infPath, fullPath.data(), pathSize) >= pathSize) {
        return driverFailed;
    }
    const HardwareIdList ids(hardwareId);
    DeviceClass deviceClass{};
    std::array<char, nameSize + 1> className{};
    if (!installer.setupFileClass(fullPath.data(), deviceClass, className.data(), nameSize)) {
        return driverFailed;
    }
    const DeviceSet set(installer, installer.createSet(&deviceClass));
    DeviceRecord device;
    if (!set.isOpen() || !installer.createDevice(set.handle(), className.data(), deviceClass, device) ||
        !installer.storeHardwareIds(set.handle(), device, ids.data(), ids.bytes()) ||
        !installer.callInstaller(InstallFunction::RegisterDevice, set.handle(), device)) {
        return driverFailed;
    }
    return updateCableDriver(installer, infPath, hardwareId);
}

/// What the removal keeps across devices.
struct RemoveContext {
    int m_count = 0;
    int m_restartNeeded = 0;
};

/// A device that cannot be removed is left alone, and the walk goes on.
int removeDevice(DeviceInstaller& installer, const DeviceSet& set, DeviceRecord& device, RemoveContext& context) {
    constexpr std::uint32_t idSize = 200;
    std::array<char, idSize + 1> id{};
    platform::Machine machine = nullptr;
    if (!installer.setDetail(set.handle(), machine) || !installer.instanceId(device, id.data(), idSize, machine) ||
        !installer.prepareRemoval(set.handle(), device) ||
        !installer.callInstaller(InstallFunction::Remove, set.handle(), device)) {
        return driverDone;
    }
    std::uint32_t flags = 0;
    if (installer.installFlags(set.handle(), device, flags) &&
        (flags & (platform::needsRestart | platform::needsReboot)) != 0) {
        context.m_restartNeeded = 1;
    }
    ++context.m_count;
    return driverDone;
}

int removeCableDevices(DeviceInstaller& installer, const char* hardwareId) {
    RemoveContext context;
    const int result = enumerateDevices(installer, platform::devicesPresent, {hardwareId},
                                        [&](const DeviceSet& set, DeviceRecord& device, std::uint32_t) {
                                            return removeDevice(installer, set, device, context);
                                        });
    if (result != driverDone || context.m_count == 0) {
        return result;
    }
    return context.m_restartNeeded != 0 ? driverNeedsRestart : driverDone;
}

}  // namespace

bool isProgCableClassPresent() {
    DeviceInstaller* const installer = platform::deviceInstaller();
    if (installer == nullptr) {
        return false;
    }
    const platform::ClassDevices cables(*installer, platform::cableClass);
    if (!cables.isOpen()) {
        std::printf("%s failed: %lx.\n", cables.failure().call, static_cast<unsigned long>(cables.failure().error));
        return false;
    }
    bool isPresent = false;
    DeviceRecord device;
    for (std::uint32_t i = 0; cables.devices().deviceAt(i, device); ++i) {
        isPresent = isCable(cables.devices(), device) || isPresent;
    }
    return isPresent;
}

int updateHexlinkCableUSBFirmware(char* infPath, const char* hardwareId) {
    if (infPath != nullptr) {
        std::replace(infPath, infPath + std::strlen(infPath), '/', '\\');
    }
    DeviceInstaller* const installer = platform::deviceInstaller();
    if (installer == nullptr) {
        return driverFailed;
    }
    const char* const id = hardwareId != nullptr ? hardwareId : "";
    installCableDriver(*installer, infPath != nullptr ? infPath : "", id);
    return removeCableDevices(*installer, id);
}
