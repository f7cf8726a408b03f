#include "CableDriver.h"

#include <gtest/gtest.h>

#include <string>
#include <tuple>
#include <vector>

#include "ScriptedInstaller.h"
#include "s/DeviceEnumerator.h"

namespace {

using Texts = std::vector<std::string>;

/// The scripted installer is that of the host while this lives.
class CableDriver : public testing::Test {
protected:
    CableDriver() { platform::replaceDeviceInstaller(&installer); }
    ~CableDriver() override { platform::replaceDeviceInstaller(nullptr); }

    FakeDevice& add(const std::string& id, const Texts& hardwareIds, const Texts& compatibleIds = {}) {
        return installer.add({id,
                              {{DeviceProperty::HardwareIds, asList(hardwareIds)},
                               {DeviceProperty::CompatibleIds, asList(compatibleIds)}}});
    }
    /// The ids of the devices for which the walk calls back, to be told the result that it shall end with.
    Texts chosen(const std::vector<const char*>& patterns, int result = driverDone) {
        Texts ids;
        installer.calls.clear();
        EXPECT_EQ(enumerateDevices(installer, platform::devicesPresent, patterns,
                                   [&](const platform::DeviceSet& set, DeviceRecord& device, std::uint32_t index) {
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

TEST(DeviceIdPattern, Matches) {
    const std::tuple<const char*, const char*, bool> cases[] = {
        {"USB\\VID_1234", "usb\\vid_1234", true},
        {"USB\\VID_1234", "USB\\VID_12", false},
        {"ABCDE", "A*E", true},
        {"ABCDE", "A*F", false},
        {"AB", "AB*B", false},
        {"ABCDE", "B*", false},
        {"A*B", "'a*b", true},
        {"AXB", "'A*B", false},
        {"", "", true},
        {"A[", "a{", false},
        {nullptr, "*", true},
        {"'A", "@''A", true},
    };
    for (const auto& [text, pattern, isMatch] : cases) {
        EXPECT_EQ(matchDeviceId(text, parseDeviceIdPattern(pattern)), isMatch) << pattern;
    }
    const DeviceIdPattern pattern = parseDeviceIdPattern("@ROOT\\*");
    EXPECT_STREQ(pattern.m_text, "ROOT\\*");
    EXPECT_EQ(pattern.m_firstWildcard, pattern.m_text + 5);
    EXPECT_NE(pattern.m_isInstanceId, 0);
    EXPECT_EQ(parseDeviceIdPattern("'@*").m_isInstanceId, 0);
    EXPECT_STREQ(parseDeviceIdPattern(nullptr).m_text, "");
}

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
        {{"*", "nothing"}, both},
        {{"=Ports"}, both, {"classOfName Ports", "presentDevices Ports 2"}},
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
        EXPECT_EQ(installer.callsBefore("setDetail"), c.opening);
    }
    installer.failing = "classOfName Many";
    installer.error = platform::bufferTooSmall;
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

TEST_F(CableDriver, TakesIdsAndPathsOfAnyLength) {
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
}

TEST_F(CableDriver, FindsACableByItsDescription) {
    const auto isPresent = [&](const char* expectedOutput = "") {
        installer.calls.clear();
        testing::internal::CaptureStdout();
        const bool result = isProgCableClassPresent();
        EXPECT_EQ(testing::internal::GetCapturedStdout(), expectedOutput);
        EXPECT_EQ(installer.openThings(), 0);
        return result;
    };
    EXPECT_FALSE(isPresent());
    for (const char* const text : {"A Zarnex USB Cable", "ZARNEX HEXLINK CABLE USB", "mouse"}) {
        add("id", {}).properties[DeviceProperty::Description] = text;
    }
    EXPECT_TRUE(isPresent());
    EXPECT_EQ(installer.calls, (Texts{"createSet", "presentDevices Cables 2 into", "setDetail", "property 0",
                                      "property 0", "property 0"}));
    installer.devices[1].properties[DeviceProperty::Description] = "zarnex usb cable";
    installer.failing = "setDetail";
    EXPECT_TRUE(isPresent());
    installer.devices.erase(installer.devices.begin() + 1);
    EXPECT_FALSE(isPresent());
    installer.failing = "createSet";
    installer.error = 0xAB;
    EXPECT_FALSE(isPresent("SetupDiCreateDeviceInfoList failed: ab.\n"));
    installer.failing = "presentDevices Cables 2 into";
    EXPECT_FALSE(isPresent("SetupDiGetClassDevsEx failed: ab.\n"));
}

TEST(CableDriverHost, WithoutAnInstallerThereIsNothingToDo) {
    if (platform::deviceInstaller() != nullptr) {
        GTEST_SKIP() << "this host has one";
    }
    std::string path = "a/b";
    EXPECT_EQ(updateHexlinkCableUSBFirmware(path.data(), "id"), 2);
    EXPECT_EQ(path, "a\\b");
    EXPECT_FALSE(isProgCableClassPresent());
}

}  // namespace
