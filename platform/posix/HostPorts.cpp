#include "platform/HostPorts.h"

#include <algorithm>
#include <cstdlib>
#include <set>
#include <string>
#include <string_view>
#include <tuple>

#include "platform/posix/PortTree.h"

namespace platform {
namespace {

constexpr const char* ttyDirectory = "/sys/class/tty";
constexpr const char* parportDirectory = "/proc/sys/dev/parport";

/// A node's name, split into what comes before its number and that number.
struct NodeName {
    std::string text;
    std::size_t stem = 0;
    int number = 0;

    bool isOf(std::string_view wanted) const { return std::string_view(text).substr(0, stem) == wanted; }
    /// The standard ports come first, then by name, and each kind by number.
    bool operator<(const NodeName& other) const {
        const auto key = [](const NodeName& name) {
            return std::make_tuple(!name.isOf("ttyS"), std::string_view(name.text).substr(0, name.stem), name.number);
        };
        return key(*this) < key(other);
    }
};

constexpr const char* digits = "0123456789";

/// The names in a directory that begin with @p prefix and end in a number that is not absurd, in order.
std::vector<NodeName> numberedNodes(const PortTree& tree, const char* directory, std::string_view prefix) {
    constexpr std::size_t mostDigits = 6;
    std::vector<NodeName> nodes;
    for (const std::string& text : tree.names(directory)) {
        const std::size_t stem = text.find_last_not_of(digits) + 1;
        const std::size_t length = text.size() - stem;
        if (text.compare(0, prefix.size(), prefix) == 0 && length > 0 && length <= mostDigits) {
            nodes.push_back({text, stem, std::atoi(text.c_str() + stem)});
        }
    }
    std::sort(nodes.begin(), nodes.end());
    return nodes;
}

/// The kernel keeps nodes of the standard driver for ports that might come; one without a UART has the type 0. Other
/// drivers make a node only for a port that is there, and a console has no driver of a device.
bool hasHardware(const PortTree& tree, const std::string& node) {
    if (const std::optional<std::string> type = tree.read(node + "/type")) {
        return std::strtol(type->c_str(), nullptr, 10) != 0;
    }
    const std::string driver = tree.linkedName(node + "/device/driver");
    return !driver.empty() && driver != "serial8250";
}

HostPort portOf(const char* kind, const NodeName& node, const char* family, int number) {
    HostPort port;
    port.text = std::string(kind) + " /dev/" + node.text + " (" + family + std::to_string(number) + ")";
    return port;
}

/// Addresses of I/O ports have 32 bits at most; 0 is none.
void addRangeFrom(std::uint64_t start, unsigned registers, const ClaimedRanges& claims, std::vector<IoRange>& ranges) {
    if (start != 0 && start <= UINT32_MAX) {
        ranges.push_back(claims.from(start, registers));
    }
}

/// Adds serial ports. A standard port has the number of its node; the others have those that are left.
class SerialPorts {
public:
    SerialPorts(const PortTree& tree, const ClaimedRanges& claims) : m_tree(tree), m_claims(claims) {}

    void addTo(std::vector<HostPort>& ports) {
        for (const NodeName& node : numberedNodes(m_tree, ttyDirectory, "tty")) {
            const std::string directory = std::string(ttyDirectory) + "/" + node.text;
            // "tty7" is a console.
            if (!node.isOf("tty") && hasHardware(m_tree, directory)) {
                ports.push_back(portOf(isOnUsb(node) ? "USB Serial Port" : "Serial Port", node, "COM", number(node)));
                addRange(directory, ports.back().ranges);
            }
        }
    }

private:
    static bool isOnUsb(const NodeName& node) { return node.isOf("ttyUSB") || node.isOf("ttyACM"); }

    int number(const NodeName& node) {
        int number = node.isOf("ttyS") ? node.number + 1 : 1;
        while (!m_taken.insert(number).second) {
            ++number;
        }
        return number;
    }

    /// A port in memory, or behind a bus, has no I/O ports.
    void addRange(const std::string& directory, std::vector<IoRange>& ranges) const {
        constexpr unsigned registers = 8;
        const std::string start = m_tree.read(directory + "/port").value_or("");
        addRangeFrom(std::strtoull(start.c_str(), nullptr, 16), registers, m_claims, ranges);
    }

    const PortTree& m_tree;
    const ClaimedRanges& m_claims;
    std::set<int> m_taken;
};

/// The file holds the starts of the standard registers and of the extended ones, in decimal, 0 for none.
void addParallelRanges(const std::string& starts, const ClaimedRanges& claims, std::vector<IoRange>& ranges) {
    constexpr unsigned registers = 3;
    const char* at = starts.c_str();
    for (int i = 0; i < 2; ++i) {
        char* end = nullptr;
        addRangeFrom(std::strtoull(at, &end, 10), registers, claims, ranges);
        at = end;
    }
}

void addParallelPorts(const PortTree& tree, const ClaimedRanges& claims, std::vector<HostPort>& ports) {
    for (const NodeName& node : numberedNodes(tree, parportDirectory, "parport")) {
        ports.push_back(portOf("Printer Port", node, "LPT", node.number + 1));
        const std::string starts =
            tree.read(std::string(parportDirectory) + "/" + node.text + "/base-addr").value_or("");
        addParallelRanges(starts, claims, ports.back().ranges);
    }
}

class KernelPorts : public HostPorts {
public:
    HostPortList list(const std::string& root) override {
        const PortTree tree(root);
        const ClaimedRanges claims(tree.read("/proc/ioports").value_or(""));
        HostPortList list;
        SerialPorts(tree, claims).addTo(list.ports);
        addParallelPorts(tree, claims, list.ports);
        return list;
    }
};

}  // namespace

HostPorts& realHostPorts() {
    static KernelPorts ports;
    return ports;
}

}  // namespace platform
