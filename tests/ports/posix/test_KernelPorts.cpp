// Trees of files as kernels hardly lay them out, beside those of whole machines that the batch prompt's cases list.
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

TEST(KernelPorts, StrangeTreesDoNoHarmAndTheirNodesDoNotCount) {
    const Tree root;
    root.write("proc/ioports", std::string("zz\n5-3 : x\n03f8-03ff\n\xff\x00-: \n03f8-ffffffffffffffff : y", 44));
    for (const char* const name : {"ttyS99999999999999999999", "ttyS", "ttyS1x", "ttyUSB\n1", "ttyS5"}) {
        root.write(std::string("sys/class/tty/") + name + "/type", "4");
    }
    root.write("sys/class/tty/ttyS5/port", "0x3F8" + std::string(100000, '9'));
    root.make("sys/class/tty/ttyS6/type");
    root.link("sys/class/tty/ttyS7", "../tty/ttyS7");
    root.link("sys/class/tty/ttyX1/device/driver", "../drivers/serial8250");
    // As kernels do since they have a bus of serial ports: a node without hardware has a driver, too.
    root.link("sys/class/tty/ttyS8/device/driver", "../drivers/port");
    root.write("sys/class/tty/ttyS8/type", "0\n");
    root.write("proc/sys/dev/parport/parport3/base-addr", "888");
    root.write("proc/sys/dev/parport/parport4/base-addr", "words");
    root.make("proc/sys/dev/parport/parport5");
    EXPECT_EQ(portsOf(root.path()), (Texts{"Serial Port /dev/ttyS5 (COM6)", "Serial Port /dev/ttyUSB\n1 (COM1)",
                                           "Printer Port /dev/parport3 (LPT4) 378-37a",
                                           "Printer Port /dev/parport4 (LPT5)", "Printer Port /dev/parport5 (LPT6)"}));
    EXPECT_EQ(portsOf("/no such directory"), Texts());
}

}  // namespace
