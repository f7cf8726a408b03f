#include "CPortResources.h"

#include <gtest/gtest.h>

#include <climits>
#include <string>
#include <vector>

#include "MessageRecorder.h"
#include "ScriptedInstaller.h"
#include "platform/InstalledPorts.h"

namespace {

using namespace platform;
using Names = std::vector<std::string>;
using Addresses = std::vector<int>;
using Kind = ConfigurationKind;

Names namesOf(CPortResources& resources, const char* type) {
    std::list<PortResource*> ports;
    EXPECT_TRUE(resources.getPortResources(type, ports));
    Names names;
    for (const PortResource* const port : ports) {
        names.emplace_back(port->getPortName());
    }
    resources.deletePortResources(ports);
    EXPECT_TRUE(ports.empty());
    return names;
}

/// None where there is no port.
Addresses addressesOf(const PortResource* port) {
    return port == nullptr ? Addresses()
                           : Addresses{port->getBaseStartAddress(), port->getBaseEndAddress(),
                                       port->getEcpStartAddress(), port->getEcpEndAddress()};
}

/// The ports of a scripted installer are those of the host while this lives.
class CPortResourcesTest : public testing::Test, public HostPorts {
protected:
    CPortResourcesTest() { replaceHostPorts(this); }
    ~CPortResourcesTest() override { replaceHostPorts(nullptr); }
    HostPortList list(const std::string&) override {
        ++listings;
        return installedPorts(installer);
    }

    FakeDevice& add(const std::string& text) { return installer.add({"", {{DeviceProperty::FriendlyName, text}}}); }
    /// Lists the ports, which prints and reports that and leaves nothing open.
    CPortResources listed(const std::string& expectedOutput = "") {
        MessageRecorder messages;
        testing::internal::CaptureStdout();
        CPortResources ports;
        std::string output = testing::internal::GetCapturedStdout();
        for (const std::string& message : messages.debug()) {
            output += message;
        }
        EXPECT_EQ(output, expectedOutput);
        EXPECT_EQ(installer.openThings(), 0);
        return ports;
    }

    ScriptedInstaller installer;
    int listings = 0;
};

TEST_F(CPortResourcesTest, SearchesByFamilyAndByName) {
    for (const char* text : {"Port (LPT1)", "A (COM3)", "B (COM12)", "Other device"}) {
        add(text);
    }
    CPortResources ports = listed("No resources.\nNo resources.\nNo resources.\nNo resources.\n");
    EXPECT_EQ(namesOf(ports, "lpt"), Names{"LPT1"});
    EXPECT_EQ(namesOf(ports, "COM"), (Names{"COM3", "COM1"}));
    EXPECT_EQ(namesOf(ports, "USB"), (Names{"usb1", "usb2", "usb3", "usb4"}));
    EXPECT_EQ(namesOf(ports, "usb2"), namesOf(ports, "USB"));

    std::list<PortResource*> found;
    for (const char* const type : {"LPT1", "", "LP", static_cast<const char*>(nullptr)}) {
        EXPECT_FALSE(ports.getPortResources(type, found));
    }
    EXPECT_TRUE(ports.getPortResources("COM", found) && ports.getPortResources("COM", found));
    EXPECT_EQ(found.size(), 4U);
    found.front()->setPortName("changed");
    ports.deletePortResources(found);

    EXPECT_STREQ(ports.getPortResource("com3")->getPortDisplayName(), "A (COM3)");
    EXPECT_STREQ(ports.getPortResource("(COM")->getPortDisplayName(), "Other device");
    for (const char* const name : {"LPT9", "usb1", "", static_cast<const char*>(nullptr)}) {
        EXPECT_EQ(ports.getPortResource(name), nullptr);
    }
    EXPECT_EQ(listings, 1);
}

TEST(CPortResources, ExtractsTheShortName) {
    const std::pair<const char*, const char*> cases[] = {
        {"(COM1) (LPT2)", "LPT2"}, {"(com1)", "(COM"}, {"cut (LPT", "LPT"}, {"", "(COM"}, {nullptr, "(COM"},
    };
    for (const auto& [text, name] : cases) {
        EXPECT_STREQ(CPortResources::extractPortName(text), name);
    }
    EXPECT_STREQ(CPortResources::extractPortName(CPortResources::extractPortName("none")), "COM");
}

TEST_F(CPortResourcesTest, PicksTheConfigurationAndStoresRangesInTurn) {
    const std::vector<IoRange> one{{1, 2}};
    const struct {
        const char* name;
        std::uint32_t status, problem;
        std::map<Kind, std::vector<IoRange>> configurations;
        Addresses addresses;
        const char* output = "";
    } cases[] = {
        {"allocated", 0, 0, {{Kind::Allocated, one}, {Kind::Forced, {{8, 9}}}}, {1, 2, -1, -1}},
        {"forced before boot", 0, 0, {{Kind::Boot, {{8, 9}}}, {Kind::Forced, one}}, {1, 2, -1, -1}},
        {"boot", 0, 29, {{Kind::Boot, one}}, {1, 2, -1, -1}},
        {"troubled", 0x400, 10, {{Kind::Allocated, {{8, 9}}}, {Kind::Boot, one}}, {1, 2, -1, -1}},
        {"disabled", 0x400, 29, {{Kind::Boot, one}}, {-1, -1, -1, -1}, "No resources.\n"},
        {"disabled, forced", 0x400, 29, {{Kind::Forced, one}}, {1, 2, -1, -1}},
        {"no range", 0, 0, {{Kind::Allocated, {}}}, {-1, -1, -1, -1}},
        {"size 0", 0, 0, {{Kind::Allocated, {{0, ULLONG_MAX}, {5, 4}, {3, 6}}}}, {3, 6, -1, -1}},
        {"third", 0, 0, {{Kind::Allocated, {{1, 2}, {3, 4}, {0xF00000005, 6}}}}, {5, 6, 3, 4}},
    };
    for (const auto& c : cases) {
        SCOPED_TRACE(c.name);
        installer.devices = {{"", {{DeviceProperty::FriendlyName, "(COM1)"}}, c.configurations, c.status, c.problem}};
        EXPECT_EQ(addressesOf(listed(c.output).getPortResource("COM1")), c.addresses);
    }
}

TEST_F(CPortResourcesTest, EachFailureOfTheHostLeavesAShorterList) {
    add("A (COM1)").configurations[Kind::Allocated] = {{1, 2}, {3, 4}};
    const char* const unknown = "SetupDiGetDeviceInfoListDetail () error = 5, 0x00000005.\n";
    const struct {
        const char* call;
        Addresses addresses;
        const char* output = "";
    } cases[] = {
        {"createSet", {}, "SetupDiCreateDeviceInfoList failed: 5.\n"},
        {"presentDevices Ports 2 into", {}, "SetupDiGetClassDevsEx failed: 5.\n"},
        {"setDetail", {1, 2, 3, 4}},
        {"property 12", {}},
        {"setDetail", {-1, -1, -1, -1}, unknown},
        {"status", {-1, -1, -1, -1}, unknown},
        {"configuration 2", {-1, -1, -1, -1}, "No resources.\n"},
        {"nextIoDescriptor", {-1, -1, -1, -1}},
        {"ioRange", {3, 4, -1, -1}},
        {"nextIoDescriptor", {1, 2, -1, -1}},
        {"ioRange", {1, 2, -1, -1}},
        {"nextIoDescriptor", {1, 2, 3, 4}},
    };
    for (const auto& c : cases) {
        SCOPED_TRACE(c.call);
        ++installer.failAt;
        installer.calls.clear();
        EXPECT_EQ(addressesOf(listed(c.output).getPortResource("COM1")), c.addresses);
        EXPECT_EQ(installer.calls[installer.failAt - 1], c.call);
    }
}

TEST_F(CPortResourcesTest, ReadsTextsOfAnyKindAndCutsThemToTheirFields) {
    const std::map<Kind, std::vector<IoRange>> configurations{{Kind::Allocated, {{1, 2}}}};
    add("first (COM1)");
    installer.add({"", {}, configurations});  // is no port for the user
    installer.add({"", {{DeviceProperty::Description, "described (COM2)"}}, configurations});
    add(std::string(5000, 'x') + "(COM3)");
    CPortResources ports = listed("No resources.\nNo resources.\n");
    EXPECT_EQ(namesOf(ports, "COM"), (Names{"COM1", "COM2", "COM3"}));
    EXPECT_EQ(addressesOf(ports.getPortResource("COM1")), (Addresses{-1, -1, -1, -1}));
    PortResource* const port = ports.getPortResource("COM3");
    EXPECT_EQ(std::string(port->getPortDisplayName()), std::string(63, 'x'));
    port->setPortName(std::string(500, 'n').c_str());
    EXPECT_EQ(std::string(port->getPortName()), std::string(15, 'n'));
    port->setPortName(nullptr);
    EXPECT_STREQ(port->getPortName(), "");
}

TEST_F(CPortResourcesTest, AHostThatNeverComesToAnEndIsStopped) {
    FakeDevice& device = add("(COM1)" + std::string(2000, 'x'));
    device.configurations[Kind::Allocated] = {{1, 2}};
    installer.growth = 1;
    EXPECT_EQ(listed().getPortResource("COM1"), nullptr);
    EXPECT_EQ(installer.count("property 12"), 16);
    installer.calls.clear();
    installer.growth = 0;
    installer.repeated = 2;
    listed();
    EXPECT_EQ(installer.count("nextIoDescriptor"), 2 * 1024);
    device.properties[DeviceProperty::FriendlyName] = "(COM1)";
    device.configurations.clear();
    installer.repeated = 1U << 20;
    testing::internal::CaptureStdout();
    CPortResources ports;
    testing::internal::GetCapturedStdout();
    EXPECT_EQ(namesOf(ports, "COM").size(), 16384U);
}

TEST_F(CPortResourcesTest, CopiesListTheSameRecordsWhicheverGoesFirst) {
    add("(COM1)").configurations[Kind::Allocated] = {{1, 2}};
    CPortResources* const instance = CPortResources::Instance();
    EXPECT_EQ(CPortResources::Instance(), instance);
    CPortResources copy(*instance);
    PortResource* const port = copy.getPortResource("COM1");
    EXPECT_EQ(port, instance->getPortResource("COM1"));
    std::list<PortResource*> records{port};
    copy.deletePortResources(records);
    instance->removeInstance();
    EXPECT_STREQ(port->getPortName(), "COM1");
    {
        CPortResources own;
        own.removeInstance();  // none is there
        PortResource* const former = own.getPortResource("COM1");
        EXPECT_NE(former, nullptr);
        own = copy;
        EXPECT_EQ(own.getPortResource("COM1"), port);
        EXPECT_STREQ(former->getPortName(), "COM1");
    }
    EXPECT_EQ(listings, 2);
    CPortResources::Instance();
    { const CPortResources other(copy); }  // takes the shared object along
    CPortResources::Instance();
    EXPECT_EQ(listings, 4);
    copy.removeInstance();
    EXPECT_EQ(copy.getPortResource("COM1"), nullptr);
    delete CPortResources::Instance();
    delete CPortResources::Instance();
    EXPECT_EQ(listings, 6);
}

}  // namespace
