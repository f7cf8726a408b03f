// Trees of files as kernels lay them out, beside those of whole machines that the batch prompt's cases list.
#include <gtest/gtest.h>

#include <filesystem>
#include <fstream>
#include <string>
#include <vector>

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

/// As kernels do since they have a bus of serial ports: the nodes without hardware have a driver, too.
TEST(KernelPorts, NodesWithoutHardwareDoNotCount) {
    const TemporaryDirectory root;
    const fs::path base = root.path();
    for (int i = 0; i < 32; ++i) {
        const std::string number = std::to_string(i);
        const fs::path device = "devices/platform/serial8250/serial8250:0/serial8250:0." + number;
        const fs::path node = device / "tty" / ("ttyS" + number);
        link(base / "sys" / device / "driver", "../../../../../bus/serial-base/drivers/port");
        link(base / "sys" / node / "device", "../../../serial8250:0." + number);
        write(base / "sys" / node / "type", i == 17 ? "4\n" : "0\n");
        write(base / "sys" / node / "port", "0x0\n");
        link(base / "sys/class/tty" / node.filename(), "../.." / node);
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
    EXPECT_EQ(portsOf("/no such directory"), Texts());
}

TEST(KernelPorts, OfThisHostAreNamedByTheirNodes) {
    for (const platform::HostPort& port : platform::hostPorts().list("").ports) {
        const bool isNamed = port.text.find("(COM") != std::string::npos || port.text.find("(LPT") != std::string::npos;
        EXPECT_TRUE(isNamed && port.text.find("/dev/") != std::string::npos) << port.text;
    }
}

}  // namespace
