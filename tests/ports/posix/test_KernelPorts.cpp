// Trees of files as kernels lay them out, beside those of whole machines that the batch prompt's cases list.
#include <gtest/gtest.h>

#include <filesystem>
#include <string>
#include <vector>

#include "TemporaryDirectory.h"
#include "platform/HostPorts.h"

namespace {

using Texts = std::vector<std::string>;

struct Tree : TemporaryDirectory {
    void link(const std::string& name, const std::string& target) const {
        make(name.substr(0, name.rfind('/')));
        std::filesystem::create_symlink(target, *this / name);
    }
};

/// Each port as one text: display name and ranges.
Texts portsOf(const std::string& root) {
    Texts texts;
    for (const platform::HostPort& port : platform::hostPorts().list(root).ports) {
        texts.push_back(port.text);
        for (const platform::IoRange& range : port.ranges) {
            char part[64];
            std::snprintf(part, sizeof part, " %lx-%lx", static_cast<unsigned long>(range.start),
                          static_cast<unsigned long>(range.end));
            texts.back() += part;
        }
    }
    return texts;
}

/// As kernels do since they have a bus of serial ports: the nodes without hardware have a driver, too.
TEST(KernelPorts, NodesWithoutHardwareDoNotCount) {
    const Tree root;
    for (int i = 0; i < 32; ++i) {
        const std::string number = std::to_string(i);
        const std::string device = "devices/platform/serial8250/serial8250:0/serial8250:0." + number;
        const std::string node = device + "/tty/ttyS" + number;
        root.link("sys/" + device + "/driver", "../../../../../bus/serial-base/drivers/port");
        root.link("sys/" + node + "/device", "../../../serial8250:0." + number);
        root.write("sys/" + node + "/type", i == 17 ? "4\n" : "0\n");
        root.write("sys/" + node + "/port", "0x0\n");
        root.link("sys/class/tty/ttyS" + number, "../../" + node);
    }
    EXPECT_EQ(portsOf(root.path()), Texts{"Serial Port /dev/ttyS17 (COM18)"});
}

TEST(KernelPorts, StrangeTreesDoNoHarm) {
    const Tree root;
    root.write("proc/ioports", std::string("zz\n5-3 : x\n03f8-03ff\n\xff\x00-: \n03f8-ffffffffffffffff : y", 44));
    for (const char* const name : {"ttyS99999999999999999999", "ttyS", "ttyS1x", "ttyUSB\n1", "ttyS5"}) {
        root.write(std::string("sys/class/tty/") + name + "/type", "4");
    }
    root.write("sys/class/tty/ttyS5/port", "0x3F8" + std::string(100000, '9'));
    root.make("sys/class/tty/ttyS6/type");
    root.link("sys/class/tty/ttyS7", "../tty/ttyS7");
    root.link("sys/class/tty/ttyX1/device/driver", "../drivers/serial8250");
    root.write("proc/sys/dev/parport/parport3/base-addr", "888");
    root.write("proc/sys/dev/parport/parport4/base-addr", "words");
    root.make("proc/sys/dev/parport/parport5");
    EXPECT_EQ(portsOf(root.path()), (Texts{"Serial Port /dev/ttyS5 (COM6)", "Serial Port /dev/ttyUSB\n1 (COM1)",
                                           "Printer Port /dev/parport3 (LPT4) 378-37a",
                                           "Printer Port /dev/parport4 (LPT5)", "Printer Port /dev/parport5 (LPT6)"}));
    EXPECT_EQ(portsOf("/no such directory"), Texts());
}

}  // namespace
