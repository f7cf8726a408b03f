// Trees of files as kernels lay them out. They hold links, so each is kept as one text: a line names a file, whose
// content follows behind "|", or a link and its target.
#include <gtest/gtest.h>

#include <filesystem>
#include <fstream>
#include <list>
#include <string>
#include <vector>

#include "CPortResources.h"
#include "TemporaryDirectory.h"
#include "platform/HostPorts.h"

namespace {

namespace fs = std::filesystem;
using Texts = std::vector<std::string>;

void makeParent(const fs::path& path) {
    fs::create_directories(path.parent_path());
}

void link(const fs::path& path, const std::string& target) {
    makeParent(path);
    fs::create_symlink(target, path);
}

void write(const fs::path& path, const std::string& content) {
    makeParent(path);
    std::ofstream(path, std::ios::app | std::ios::binary) << content;
}

void build(const std::string& tree, const fs::path& root) {
    std::ifstream lines(TEST_DATA_DIR "/hosts/" + tree + ".tree");
    ASSERT_TRUE(lines.is_open());
    fs::path current;
    for (std::string line; std::getline(lines, line);) {
        const std::size_t arrow = line.find(" -> ");
        const std::size_t bar = line.find("| ");
        if (line[0] == '#') {
            continue;
        }
        if (arrow != std::string::npos) {
            link(root / line.substr(0, arrow), line.substr(arrow + 4));
        } else if (line[0] != ' ') {
            write(current = root / line, "");
        } else if (bar != std::string::npos) {
            write(current, line.substr(bar + 2) + "\n");
        }
    }
}

/// The port as one text: display name and ranges.
std::string shown(const platform::HostPort& port) {
    std::string text = port.text;
    for (const platform::IoRange& range : port.ranges) {
        char part[64];
        std::snprintf(part, sizeof part, " %lx-%lx", static_cast<unsigned long>(range.start),
                      static_cast<unsigned long>(range.end));
        text += part;
    }
    return text;
}

Texts portsOf(const std::string& root) {
    Texts texts;
    for (const platform::HostPort& port : platform::hostPorts().list(root).ports) {
        texts.push_back(shown(port));
    }
    return texts;
}

TEST(KernelPorts, AreThoseWithHardware) {
    const struct {
        const char* tree;
        Texts ports;
    } cases[] = {
        {"pc",
         {"Serial Port /dev/ttyS0 (COM1) 3f8-3ff", "Serial Port /dev/ttyS1 (COM2) 2f8-2ff",
          "Printer Port /dev/parport0 (LPT1) 378-37f 778-77a"}},
        {"board", {}},
        {"usb",
         {"Serial Port /dev/ttyS0 (COM1) c0c0-c0c7", "USB Serial Port /dev/ttyACM0 (COM2)",
          "Serial Port /dev/ttyAMA0 (COM3)", "USB Serial Port /dev/ttyUSB0 (COM4)",
          "USB Serial Port /dev/ttyUSB2 (COM5)", "USB Serial Port /dev/ttyUSB10 (COM6)",
          "Printer Port /dev/parport0 (LPT1)"}},
    };
    for (const auto& c : cases) {
        SCOPED_TRACE(c.tree);
        const TemporaryDirectory root;
        build(c.tree, root.path());
        EXPECT_EQ(portsOf(root.path()), c.ports);
    }
    EXPECT_EQ(portsOf("/no such directory"), Texts());
}

/// As kernels do since they have a bus of serial ports: the nodes without hardware have a driver, too.
TEST(KernelPorts, NodesWithoutHardwareDoNotCount) {
    const TemporaryDirectory root;
    const fs::path base = root.path();
    for (int i = 0; i < 32; ++i) {
        const std::string number = std::to_string(i);
        const std::string device = "devices/platform/serial8250/serial8250:0/serial8250:0." + number;
        const std::string node = device + "/tty/ttyS" + number;
        link(base / "sys" / device / "driver", "../../../../../bus/serial-base/drivers/port");
        link(base / "sys" / node / "device", "../../../serial8250:0." + number);
        write(base / "sys" / node / "type", i == 17 ? "4\n" : "0\n");
        write(base / "sys" / node / "port", "0x0\n");
        link(base / "sys/class/tty" / ("ttyS" + number), "../../" + node);
    }
    EXPECT_EQ(portsOf(root.path()), Texts{"Serial Port /dev/ttyS17 (COM18)"});
}

TEST(KernelPorts, StrangeTreesDoNoHarm) {
    const TemporaryDirectory root;
    const fs::path base = root.path();
    write(base / "proc/ioports", std::string("zz\n5-3 : x\n03f8-03ff\n\xff\x00-: \n03f8-ffffffffffffffff : y", 44));
    for (const char* const name : {"ttyS99999999999999999999", "ttyS", "ttyS1x", "ttyUSB\n1", "ttyS5"}) {
        write(base / "sys/class/tty" / name / "type", "4");
    }
    write(base / "sys/class/tty/ttyS5/port", "0x3F8" + std::string(100000, '9'));
    fs::create_directories(base / "sys/class/tty/ttyS6/type");
    link(base / "sys/class/tty/ttyS7", "../tty/ttyS7");
    link(base / "sys/class/tty/ttyX1/device/driver", "../drivers/serial8250");
    write(base / "proc/sys/dev/parport/parport3/base-addr", "888");
    write(base / "proc/sys/dev/parport/parport4/base-addr", "words");
    fs::create_directories(base / "proc/sys/dev/parport/parport5");
    EXPECT_EQ(portsOf(root.path()), (Texts{"Serial Port /dev/ttyS5 (COM6)", "Serial Port /dev/ttyUSB\n1 (COM1)",
                                           "Printer Port /dev/parport3 (LPT4) 378-37a",
                                           "Printer Port /dev/parport4 (LPT5)", "Printer Port /dev/parport5 (LPT6)"}));
}

TEST(KernelPorts, AreLookedForBelowTheHostRoot) {
    const TemporaryDirectory root;
    build("pc", root.path());
    CPortResources::setHostRoot((root.path() + "/").c_str());
    CPortResources& ports = *CPortResources::Instance();
    CPortResources::setHostRoot(nullptr);
    std::list<PortResource*> found;
    EXPECT_TRUE(ports.getPortResources("LPT", found));
    ASSERT_EQ(found.size(), 1U);
    EXPECT_STREQ(found.front()->getPortDisplayName(), "Printer Port /dev/parport0 (LPT1)");
    EXPECT_EQ(found.front()->getBaseStartAddress(), 0x378);
    EXPECT_EQ(found.front()->getEcpEndAddress(), 0x77a);
    ports.deletePortResources(found);
    EXPECT_NE(ports.getPortResource("COM2"), nullptr);
    ports.removeInstance();
}

TEST(KernelPorts, OfThisHostAreNamedByTheirNodes) {
    for (const platform::HostPort& port : platform::hostPorts().list("").ports) {
        const bool isNamed = port.text.find("(COM") != std::string::npos || port.text.find("(LPT") != std::string::npos;
        EXPECT_TRUE(isNamed && port.text.find("/dev/") != std::string::npos) << port.text;
    }
}

}  // namespace
