#include "HostCommands.h"

#include <cstdio>
#include <list>
#include <string>

#include "ImageCommands.h"

namespace {

/// A range of I/O addresses; empty where the host told none.
std::string range(int start, int end) {
    char text[32] = "";
    if (start != -1) {
        std::snprintf(text, sizeof text, "%04X-%04X", static_cast<unsigned int>(start), static_cast<unsigned int>(end));
    }
    return text;
}

void listPort(PortResource& port) {
    std::printf("  %-6s %-11s %-11s %s\n", port.getPortName(),
                range(port.getBaseStartAddress(), port.getBaseEndAddress()).c_str(),
                range(port.getEcpStartAddress(), port.getEcpEndAddress()).c_str(), port.getPortDisplayName());
}

void listPorts() {
    CPortResources& host = *CPortResources::Instance();
    std::list<PortResource*> ports;
    host.getPortResources("LPT", ports);
    host.getPortResources("COM", ports);
    if (ports.empty()) {
        std::puts("  this host has no serial or parallel ports");
        return;
    }
    std::printf("  %-6s %-11s %-11s %s\n", "port", "base", "ECP", "name");
    for (PortResource* const port : ports) {
        listPort(*port);
    }
    host.deletePortResources(ports);
}

}  // namespace

bool info(Session&, const HkCmdArgs& args) {
    if (args.isGiven("-ports")) {
        listPorts();
    }
    if (args.isGiven("-prom")) {
        listProms(args.text("-prom"));
    }
    return true;
}
