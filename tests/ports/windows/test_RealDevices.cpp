// The host's own device set-up calls, on a device of the Ports class that the test registers and takes away again.
#include <gtest/gtest.h>

#include <windows.h>
// What follows needs the one above.
#include <setupapi.h>

#include <string>
#include <vector>

#include "CPortResources.h"
#include "CableDriver.h"
#include "TemporaryDirectory.h"
#include "platform/HostPorts.h"
#include "platform/SystemRestart.h"
#include "s/DeviceEnumerator.h"

namespace {

using platform::DeviceInstaller;
using platform::DeviceProperty;
using platform::DeviceRecord;
using platform::DeviceSet;
using platform::InstallFunction;

constexpr char hardwareId[] = "TESSAL\\TestPort\0";  // a list of one
constexpr char friendlyName[] = "Tessal test port (COM7)";

using Texts = std::vector<std::string>;

/// Wine has neither the resource calls of the configuration manager, which end the process, nor removal parameters.
bool isWine() {
    return GetProcAddress(GetModuleHandleA("ntdll.dll"), "wine_get_version") != nullptr;
}

DeviceInstaller& host() {
    return *platform::realDeviceInstaller();
}

class RealDevices : public testing::Test {
protected:
    RealDevices() { removeAll(); }
    ~RealDevices() override { removeAll(); }

    /// Without removal parameters, which not every host has.
    static void removeAll() {
        enumerateDevices(host(), 0, {hardwareId}, [](const DeviceSet& set, DeviceRecord& device, std::uint32_t) {
            host().callInstaller(InstallFunction::Remove, set.handle(), device);
            return 0;
        });
    }
    static void registerPort() {
        const DeviceSet set(host(), host().createSet(&platform::portsClass));
        DeviceRecord device;
        ASSERT_TRUE(host().createDevice(set.handle(), "Ports", platform::portsClass, device));
        ASSERT_TRUE(host().storeHardwareIds(set.handle(), device, hardwareId, sizeof hardwareId));
        SP_DEVINFO_DATA data{};
        data.cbSize = sizeof data;
        const auto handle = reinterpret_cast<HDEVINFO>(set.handle());
        ASSERT_NE(SetupDiEnumDeviceInfo(handle, 0, &data), 0);
        ASSERT_NE(SetupDiSetDeviceRegistryPropertyA(handle, &data, SPDRP_FRIENDLYNAME,
                                                    reinterpret_cast<const BYTE*>(friendlyName), sizeof friendlyName),
                  0);
        ASSERT_TRUE(host().callInstaller(InstallFunction::RegisterDevice, set.handle(), device));
    }
    static Texts chosen(const std::vector<const char*>& patterns) {
        Texts names;
        EXPECT_EQ(enumerateDevices(host(), platform::devicesPresent, patterns,
                                   [&](const DeviceSet& set, DeviceRecord& device, std::uint32_t) {
                                       names.push_back(set.text(device, DeviceProperty::FriendlyName).value_or("-"));
                                       return 0;
                                   }),
                  driverDone);
        return names;
    }
};

TEST_F(RealDevices, ARegisteredPortIsFoundByItsPatterns) {
    registerPort();
    const Texts port{friendlyName};
    for (const char* const pattern : {hardwareId, "tessal\\TEST*", "@root\\ports\\*", "*\\testport"}) {
        EXPECT_EQ(chosen({pattern}), port) << pattern;
        EXPECT_EQ(chosen({"=Ports", pattern}), port) << pattern;
    }
    EXPECT_EQ(chosen({"=Ports"}), port);
    EXPECT_EQ(chosen({"@ROOT\\PORTS\\0000"}), port);
    EXPECT_EQ(chosen({"'TESSAL\\TEST*"}).size(), 0U);
    EXPECT_EQ(chosen({"=NoSuchClass"}).size(), 0U);
    EXPECT_GE(chosen({"*"}).size(), 1U);
    removeAll();
    EXPECT_EQ(chosen({hardwareId}).size(), 0U);
}

TEST_F(RealDevices, ItsPropertiesAndStatusAreRead) {
    registerPort();
    const platform::ClassDevices ports(host(), platform::portsClass);
    ASSERT_TRUE(ports.isOpen());
    const DeviceSet& set = ports.devices();
    DeviceRecord device;
    ASSERT_TRUE(set.deviceAt(0, device));
    EXPECT_EQ(set.text(device, DeviceProperty::FriendlyName), friendlyName);
    EXPECT_EQ(set.text(device, DeviceProperty::Description), std::nullopt);
    EXPECT_EQ(set.list(device, DeviceProperty::HardwareIds), Texts{hardwareId});
    char buffer[4] = "";
    std::uint32_t type = 0;
    std::uint32_t needed = 0;
    EXPECT_FALSE(host().property(set.handle(), device, DeviceProperty::FriendlyName, type, buffer, 4, needed));
    EXPECT_EQ(host().lastError(), platform::bufferTooSmall);
    EXPECT_EQ(type, platform::textType);
    EXPECT_EQ(needed, sizeof friendlyName);
    std::uint32_t status = 1;
    std::uint32_t problem = 1;
    EXPECT_TRUE(host().status(device, nullptr, status, problem));
    std::uint32_t flags = 0;
    EXPECT_TRUE(host().installFlags(set.handle(), device, flags));
    EXPECT_FALSE(set.deviceAt(1, device));
    EXPECT_FALSE(isProgCableClassPresent());
}

TEST_F(RealDevices, PortsAreListed) {
    if (isWine()) {
        EXPECT_EQ(platform::hostPorts().list("").ports.size(), 0U);
        GTEST_SKIP() << "the resources of a registered port cannot be asked for here";
    }
    registerPort();
    CPortResources ports;
    EXPECT_STREQ(ports.getPortResource("COM7")->getPortDisplayName(), friendlyName);
}

/// The removal ends at its parameters where the host has none.
TEST_F(RealDevices, AnUpdateRegistersADevice) {
    const TemporaryDirectory directory;
    std::string path = directory.write("port.inf",
                                       "[Version]\r\nSignature=\"$CHICAGO$\"\r\nClass=Ports\r\n"
                                       "ClassGuid={4D36E978-E325-11CE-BFC1-08002BE10318}\r\n");
    EXPECT_EQ(updateHexlinkCableUSBFirmware(path.data(), hardwareId), 0);
    EXPECT_EQ(chosen({hardwareId}).size(), isWine() ? 1U : 0U);
}

/// Everything up to the restart itself, which no test calls.
TEST(RealRestart, ThePrivilegeIsThere) {
    platform::SystemRestart& restart = *platform::realSystemRestart();
    platform::Token token = nullptr;
    if (!restart.openThreadToken(platform::adjustAndQuery, token)) {
        ASSERT_EQ(restart.lastError(), platform::noToken);
        ASSERT_TRUE(restart.openProcessToken(platform::adjustAndQuery, token));
    }
    platform::Privilege privilege;
    EXPECT_TRUE(restart.findPrivilege("SeShutdownPrivilege", privilege));
    EXPECT_NE(privilege.low, 0U);
    EXPECT_TRUE(restart.enablePrivilege(token, privilege));
    restart.closeToken(token);
}

}  // namespace
