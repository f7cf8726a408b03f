#include "CableDriver.h"

#include <gtest/gtest.h>

#include <algorithm>
#include <string>
#include <vector>

#include "ScriptedInstaller.h"
#include "s/DeviceEnumerator.h"

namespace {

using namespace platform;
using Texts = std::vector<std::string>;

/// The scripted installer is that of the host while this lives.
class CableDriver : public testing::Test {
protected:
    CableDriver() { replaceDeviceInstaller(&installer); }
    ~CableDriver() override { replaceDeviceInstaller(nullptr); }

    FakeDevice& add(const std::string& id, const Texts& hardwareIds, const Texts& compatibleIds = {}) {
        return installer.add({id,
                              {{DeviceProperty::HardwareIds, asList(hardwareIds)},
                               {DeviceProperty::CompatibleIds, asList(compatibleIds)}}});
    }
    /// The ids of the devices for which the walk calls back, to be told the result that it shall end with.
    Texts chosen(const std::vector<const char*>& patterns, int result = driverDone) {
        Texts ids;
        installer.calls.clear();
        EXPECT_EQ(enumerateDevices(installer, devicesPresent, patterns,
                                   [&](const DeviceSet& set, DeviceRecord& device, std::uint32_t index) {
                                       DeviceRecord same;
                                       EXPECT_TRUE(set.deviceAt(index, same) && same.node == device.node);
                                       ids.push_back(installer.devices[device.node].id);
                                       return result;
                                   }),
                  result);
        EXPECT_EQ(installer.openThings(), 0);
        return ids;
    }
    int update(const char* hardwareId) {
        std::string path = "dir/cable.inf";
        const int result = updateHexlinkCableUSBFirmware(path.data(), hardwareId);
        EXPECT_EQ(path, "dir\\cable.inf");
        EXPECT_EQ(installer.openThings(), 0);
        return result;
    }

    ScriptedInstaller installer;
};

TEST_F(CableDriver, PatternsChooseDevices) {
    add("ROOT\\A\\0", {"USB\\one", "USB\\two"}, {"USB\\common"});
    add("ROOT\\B\\0", {"other"}, {"USB\\common"});
    const Texts both{"ROOT\\A\\0", "ROOT\\B\\0"};
    const struct {
        std::vector<const char*> patterns;
        Texts ids;
        Texts opening = {"presentDevices 6"};  // the calls that make the set
    } cases[] = {
        {{"usb\\TWO"}, {"ROOT\\A\\0"}},
        {{"USB\\common"}, both},
        {{"nothing", "oth*"}, {"ROOT\\B\\0"}},
        {{"@ROOT\\B*"}, {"ROOT\\B\\0"}, {"presentDevices 6", "openDevice ROOT\\B*"}},
        {{"ROOT\\*"}, {}},
        {{"@ROOT\\B\\0"}, {"ROOT\\B\\0"}, {"createSetOnMachine", "openDevice ROOT\\B\\0"}},
        {{"@ROOT\\B\\0", "@none"}, {"ROOT\\B\\0"}, {"createSetOnMachine", "openDevice ROOT\\B\\0", "openDevice none"}},
        {{"*"}, both},
        {{"'*"}, {}},
        {{}, both},
        {{"=Ports", "oth*"}, {"ROOT\\B\\0"}, {"classOfName Ports", "presentDevices Ports 2"}},
        {{"=Ports", "*", "@gone"}, both, {"classOfName Ports", "presentDevices Ports 2", "openDevice gone"}},
        {{"=Ports", "@ROOT\\A\\0"},
         {"ROOT\\A\\0"},
         {"classOfName Ports", "createSetOnMachine Ports", "openDevice ROOT\\A\\0"}},
        {{"="}, {}},
    };
    for (const auto& c : cases) {
        SCOPED_TRACE(testing::PrintToString(c.patterns));
        EXPECT_EQ(chosen(c.patterns), c.ids);
        const Texts& calls = installer.calls;
        EXPECT_EQ(Texts(calls.begin(), std::find(calls.begin(), calls.end(), "setDetail")), c.opening);
    }
    installer.failing = "classOfName Many";
    installer.error = bufferTooSmall;
    EXPECT_EQ(chosen({"=Many"}), both);
    installer.failing = "classOfName Broken";
    installer.error = 5;
    EXPECT_EQ(chosen({"=Broken"}, driverFailed), Texts());
    installer.classCount = 0;
    EXPECT_EQ(chosen({"=None"}), Texts());
    EXPECT_EQ(installer.calls, Texts{"classOfName None"});
}

TEST_F(CableDriver, TheWalkEndsAtAResultAndReadsListsThatGrow) {
    add("A", {std::string(9000, 'x'), "wanted"});
    add("B", {"wanted"});
    add("C", {}).properties[DeviceProperty::HardwareIds] = "no end";
    EXPECT_EQ(chosen({"no end"}), Texts{"C"});
    EXPECT_EQ(chosen({"wanted"}), (Texts{"A", "B"}));
    EXPECT_EQ(chosen({"wanted"}, 42), Texts{"A"});
    installer.growth = 2;
    EXPECT_EQ(chosen({"wanted"}), Texts{"B"});  // the first one's list grows faster than it can be read
    EXPECT_EQ(installer.count("property 1"), 16 + 1 + 1);
}

TEST_F(CableDriver, EachFailureHasItsResultAndLeavesNothingOpen) {
    add("A", {"cable"}).flags = 0x80;
    const struct {
        const char* call;
        int result;
        std::size_t removed;
        std::size_t calls;
    } cases[] = {
        {"fullPath dir\\cable.inf", 1, 1, 10},
        {"setupFileClass dir\\cable.inf", 1, 1, 10},
        {"createSet Cables", 1, 1, 11},
        {"createDevice Cables Cables", 1, 1, 12},
        {"storeHardwareIds", 1, 1, 13},
        {"callInstaller 25", 1, 1, 14},
        {"loadLibrary newdev.dll", 1, 1, 15},
        {"findEntry UpdateDriverForPlugAndPlayDevicesA", 1, 1, 16},
        {"updateDriver cable dir\\cable.inf", 1, 1, 17},
        {"presentDevices 6", 2, 0, 10},
        {"setDetail", 2, 0, 11},
        {"property 1", 0, 0, 13},
        {"setDetail", 0, 0, 13},
        {"instanceId", 0, 0, 14},
        {"prepareRemoval", 0, 0, 15},
        {"callInstaller 5", 0, 0, 16},
        {"installFlags", 0, 1, 17},
    };
    for (const auto& c : cases) {
        SCOPED_TRACE(c.call);
        ++installer.failAt;
        installer.calls.clear();
        installer.removed.clear();
        EXPECT_EQ(update("cable"), c.result);
        EXPECT_EQ(installer.calls[installer.failAt - 1], c.call);
        EXPECT_EQ(installer.removed.size(), c.removed);
        EXPECT_EQ(installer.calls.size(), c.calls);
    }
}

TEST_F(CableDriver, CountsWhatWasRemoved) {
    EXPECT_EQ(update("cable"), 0);
    for (const char* const id : {"A", "B", "C"}) {
        add(id, {"cable"});
    }
    EXPECT_EQ(update("CABLE"), 0);
    EXPECT_EQ(installer.removed, (Texts{"A", "B", "C"}));
    EXPECT_EQ(installer.hardwareIds, std::string("CABLE\0", 7));
    installer.failing = "prepareRemoval";
    installer.devices[1].flags = 0x100;
    EXPECT_EQ(update("cable"), 1);
    EXPECT_EQ(installer.removed, (Texts{"A", "B", "C", "B", "C"}));
}

TEST_F(CableDriver, TakesIdsAndPathsOfAnyLengthAndNone) {
    const std::string longId(300, 'i');
    add("A", {longId});
    add("B", {longId.substr(0, 111)});
    installer.pathLength = 260;
    EXPECT_EQ(update(longId.c_str()), 0);
    EXPECT_EQ(installer.removed, Texts{"A"});
    EXPECT_EQ(installer.count("createSet Cables"), 0);
    installer.pathLength = 259;
    update(longId.c_str());
    EXPECT_EQ(installer.hardwareIds, std::string(255, 'i') + std::string(2, '\0'));
    EXPECT_EQ(updateHexlinkCableUSBFirmware(nullptr, nullptr), 0);
    EXPECT_TRUE(matchDeviceId(nullptr, parseDeviceIdPattern(nullptr)));
}

TEST_F(CableDriver, FindsACableByItsDescription) {
    const struct {
        const char* description;
        const char* failing;
        bool isPresent;
        const char* output = "";
    } cases[] = {
        {"A Zarnex USB Cable", "", false},
        {"ZARNEX HEXLINK CABLE USB", "", true},
        {"zarnex usb cable", "setDetail", true},
        {"Zarnex USB Cable", "property 0", false},
        {"Zarnex USB Cable", "createSet", false, "SetupDiCreateDeviceInfoList failed: ab.\n"},
        {"Zarnex USB Cable", "presentDevices Cables 2 into", false, "SetupDiGetClassDevsEx failed: ab.\n"},
    };
    installer.error = 0xAB;
    for (const auto& c : cases) {
        SCOPED_TRACE(std::string(c.description) + ", failing " + c.failing);
        installer.devices = {{"cable", {{DeviceProperty::Description, c.description}}}, {"mouse", {}}};
        installer.failing = c.failing;
        testing::internal::CaptureStdout();
        const bool isPresent = isProgCableClassPresent();
        EXPECT_EQ(testing::internal::GetCapturedStdout(), c.output);
        EXPECT_EQ(isPresent, c.isPresent);
        EXPECT_EQ(installer.openThings(), 0);
    }
}

TEST(CableDriverHost, WithoutAnInstallerOrARestartThereIsNothingToDo) {
    if (deviceInstaller() != nullptr) {
        GTEST_SKIP() << "this host has one";
    }
    std::string path = "a/b";
    EXPECT_EQ(updateHexlinkCableUSBFirmware(path.data(), "id"), 2);
    EXPECT_EQ(path, "a\\b");
    EXPECT_FALSE(isProgCableClassPresent());
    Reboot();
}

}  // namespace
