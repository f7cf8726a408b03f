#include "CPortResources.h"

#include <gtest/gtest.h>

#include <climits>
#include <string>
#include <vector>

#include "MessageRecorder.h"
#include "ScriptedInstaller.h"
#include "platform/InstalledPorts.h"

namespace {

using Names = std::vector<std::string>;

/// The ports of a scripted installer are those of the host while this lives.
class CPortResourcesTest : public testing::Test, public platform::HostPorts {
protected:
    CPortResourcesTest() { platform::replaceHostPorts(this); }
    ~CPortResourcesTest() override {
        if (m_hasInstance) {
            CPortResources::Instance()->removeInstance();
        }
        platform::replaceHostPorts(nullptr);
        EXPECT_EQ(installer.openThings(), 0);
    }
    platform::HostPortList list(const std::string&) override {
        ++listings;
        return platform::installedPorts(installer);
    }

    FakeDevice& add(const char* text) {
        FakeDevice device;
        device.properties[DeviceProperty::FriendlyName] = text;
        installer.devices.push_back(device);
        return installer.devices.back();
    }
    CPortResources& instance() {
        m_hasInstance = true;
        return *CPortResources::Instance();
    }
    void endInstance() {
        m_hasInstance = false;
        CPortResources::Instance()->removeInstance();
    }

    ScriptedInstaller installer;
    int listings = 0;

private:
    bool m_hasInstance = false;
};

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

std::vector<int> addressesOf(const PortResource* port) {
    return {port->getBaseStartAddress(), port->getBaseEndAddress(), port->getEcpStartAddress(),
            port->getEcpEndAddress()};
}

TEST_F(CPortResourcesTest, SearchesByFamilyAndByName) {
    for (const char* text : {"Port (LPT1)", "A (COM3)", "B (COM12)", "Other device"}) {
        add(text);
    }
    testing::internal::CaptureStdout();
    CPortResources& ports = instance();
    EXPECT_EQ(testing::internal::GetCapturedStdout(), "No resources.\nNo resources.\nNo resources.\nNo resources.\n");
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
    EXPECT_EQ(CPortResources::Instance(), &ports);
}

TEST(PortResource, CutsTextsThatAreTooLong) {
    PortResource port;
    EXPECT_EQ(addressesOf(&port), (std::vector<int>{-1, -1, -1, -1}));
    port.setPortDisplayName(std::string(500, 'd').c_str());
    port.setPortName(std::string(500, 'n').c_str());
    EXPECT_EQ(std::string(port.getPortDisplayName()), std::string(63, 'd'));
    EXPECT_EQ(std::string(port.getPortName()), std::string(15, 'n'));
    EXPECT_EQ(port.getBaseStartAddress(), -1);
    port.setPortName(nullptr);
    EXPECT_STREQ(port.getPortName(), "");
}

TEST(CPortResources, ExtractsTheShortName) {
    const struct {
        const char* text;
        const char* name;
    } cases[] = {
        {"Printer Port (LPT1)", "LPT1"},
        {"Communications Port (COM3)", "COM3"},
        {"(COM12)", "COM1"},
        {"USB device", "(COM"},
        {"(COM1) (LPT2)", "LPT2"},
        {"(com1)", "(COM"},
        {"cut (LPT", "LPT"},
        {"", "(COM"},
        {nullptr, "(COM"},
    };
    for (const auto& c : cases) {
        EXPECT_STREQ(CPortResources::extractPortName(c.text), c.name);
    }
    EXPECT_STREQ(CPortResources::extractPortName(CPortResources::extractPortName("none")), "COM");
}

TEST_F(CPortResourcesTest, PicksTheConfigurationAndStoresRangesInTurn) {
    using Kind = ConfigurationKind;
    const std::vector<IoRange> one{{1, 2}};
    const struct {
        const char* name;
        std::uint32_t status, problem;
        std::map<Kind, std::vector<IoRange>> configurations;
        std::vector<int> addresses;
        const char* output;
    } cases[] = {
        {"allocated", 0, 0, {{Kind::Allocated, one}, {Kind::Forced, {{8, 9}}}}, {1, 2, -1, -1}, ""},
        {"forced before boot", 0, 0, {{Kind::Boot, {{8, 9}}}, {Kind::Forced, one}}, {1, 2, -1, -1}, ""},
        {"boot", 0, 29, {{Kind::Boot, one}}, {1, 2, -1, -1}, ""},
        {"troubled", 0x400, 10, {{Kind::Allocated, {{8, 9}}}, {Kind::Boot, one}}, {1, 2, -1, -1}, ""},
        {"disabled", 0x400, 29, {{Kind::Boot, one}}, {-1, -1, -1, -1}, "No resources.\n"},
        {"disabled, forced", 0x400, 29, {{Kind::Forced, one}}, {1, 2, -1, -1}, ""},
        {"none", 0, 0, {}, {-1, -1, -1, -1}, "No resources.\n"},
        {"no range", 0, 0, {{Kind::Allocated, {}}}, {-1, -1, -1, -1}, ""},
        {"size 0", 0, 0, {{Kind::Allocated, {{0, ULLONG_MAX}, {5, 4}, {3, 6}}}}, {3, 6, -1, -1}, ""},
        {"third", 0, 0, {{Kind::Allocated, {{1, 2}, {3, 4}, {0xF00000005, 6}}}}, {5, 6, 3, 4}, ""},
    };
    for (const auto& c : cases) {
        SCOPED_TRACE(c.name);
        installer.devices.clear();
        FakeDevice& device = add("(COM1)");
        device.status = c.status;
        device.problem = c.problem;
        device.configurations = c.configurations;
        testing::internal::CaptureStdout();
        PortResource* const port = instance().getPortResource("COM1");
        EXPECT_EQ(testing::internal::GetCapturedStdout(), c.output);
        EXPECT_EQ(addressesOf(port), c.addresses);
        endInstance();
    }
}

TEST_F(CPortResourcesTest, EachFailureOfTheHostLeavesAShorterList) {
    add("A (COM1)").configurations[ConfigurationKind::Allocated] = {{1, 2}, {3, 4}};
    const struct {
        const char* call;
        std::size_t ports;
        std::vector<int> addresses;
        const char* output;
    } cases[] = {
        {"createSet", 0, {}, "SetupDiCreateDeviceInfoList failed: 5.\n"},
        {"presentDevices Ports 2 into", 0, {}, "SetupDiGetClassDevsEx failed: 5.\n"},
        {"setDetail", 1, {1, 2, 3, 4}, ""},
        {"property 12", 0, {}, ""},
        {"setDetail", 1, {-1, -1, -1, -1}, ""},
        {"status", 1, {-1, -1, -1, -1}, ""},
        {"configuration 2", 1, {-1, -1, -1, -1}, "No resources.\n"},
        {"nextIoDescriptor", 1, {-1, -1, -1, -1}, ""},
        {"ioRange", 1, {3, 4, -1, -1}, ""},
        {"nextIoDescriptor", 1, {1, 2, -1, -1}, ""},
        {"ioRange", 1, {1, 2, -1, -1}, ""},
        {"nextIoDescriptor", 1, {1, 2, 3, 4}, ""},
    };
    std::size_t step = 0;
    std::size_t propertyReads = 0;
    for (const auto& c : cases) {
        SCOPED_TRACE(c.call);
        installer.calls.clear();
        installer.failAt = ++step;
        MessageRecorder messages;
        testing::internal::CaptureStdout();
        CPortResources& ports = instance();
        EXPECT_EQ(testing::internal::GetCapturedStdout(), c.output);
        EXPECT_EQ(installer.calls[step - 1], c.call);
        EXPECT_EQ(namesOf(ports, "COM").size(), c.ports);
        if (c.ports != 0) {
            EXPECT_EQ(addressesOf(ports.getPortResource("COM1")), c.addresses);
        }
        const bool isUnknown = step == 5 || step == 6;
        EXPECT_EQ(messages.debug(),
                  Names(isUnknown ? 1 : 0, "SetupDiGetDeviceInfoListDetail () error = 5, 0x00000005.\n"));
        propertyReads += installer.called("property 0") ? 1 : 0;
        EXPECT_EQ(installer.openThings(), 0);
        endInstance();
    }
    EXPECT_EQ(propertyReads, 1U);
}

TEST_F(CPortResourcesTest, ReadsTextsOfAnyKind) {
    add("first (COM1)");
    FakeDevice& silent = add("");
    silent.properties.clear();
    silent.configurations[ConfigurationKind::Allocated] = {{1, 2}};
    add("").properties = {{DeviceProperty::Description, "described (COM2)"}};
    add((std::string(5000, 'x') + "(COM3)").c_str());
    CPortResources& ports = instance();
    EXPECT_EQ(namesOf(ports, "COM"), (Names{"COM1", "COM2", "COM3"}));
    EXPECT_EQ(addressesOf(ports.getPortResource("COM1")), (std::vector<int>{-1, -1, -1, -1}));
    EXPECT_EQ(std::string(ports.getPortResource("COM3")->getPortDisplayName()), std::string(63, 'x'));
}

TEST_F(CPortResourcesTest, AHostThatNeverComesToAnEndIsStopped) {
    add((std::string(2000, 'x') + "(COM1)").c_str()).configurations[ConfigurationKind::Allocated] = {{1, 2}};
    installer.growth = 1;
    EXPECT_EQ(instance().getPortResource("COM1"), nullptr);
    EXPECT_EQ(std::count(installer.calls.begin(), installer.calls.end(), "property 12"), 16);
    endInstance();
    installer.growth = 0;
    installer.isEndless = true;
    installer.devices[0].properties[DeviceProperty::FriendlyName] = "(COM1)";
    installer.lastDevice = 2;
    installer.calls.clear();
    instance();
    EXPECT_EQ(std::count(installer.calls.begin(), installer.calls.end(), "nextIoDescriptor"), 2 * 1024);
    endInstance();
    installer.lastDevice = 1U << 20;
    installer.devices[0].configurations.clear();
    testing::internal::CaptureStdout();
    EXPECT_EQ(namesOf(instance(), "COM").size(), 16384U);
    testing::internal::GetCapturedStdout();
}

TEST_F(CPortResourcesTest, CopiesListTheSameRecordsWhicheverGoesFirst) {
    add("(COM1)").configurations[ConfigurationKind::Allocated] = {{1, 2}};
    CPortResources copy(instance());
    PortResource* const port = copy.getPortResource("COM1");
    EXPECT_EQ(port, instance().getPortResource("COM1"));
    std::list<PortResource*> listed{port};
    copy.deletePortResources(listed);
    endInstance();
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
    instance();
    const int before = listings;
    { const CPortResources other(copy); }  // takes the shared object along
    instance();
    EXPECT_EQ(listings, before + 1);
    copy.removeInstance();
    EXPECT_EQ(copy.getPortResource("COM1"), nullptr);
    delete &instance();
    instance();
    EXPECT_EQ(listings, before + 3);
}

}  // namespace
