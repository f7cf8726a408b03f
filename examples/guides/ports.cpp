// Host ports and cable drivers of docs/guides.md.

#include <TessalUtility.h>

#include <cstdio>
#include <list>

namespace {

/// A tool's own way to ask and to restart, in place of the host's dialogues.
class AskOnTerminal : public SystemRestarter {
public:
    bool confirm(const char* text, const char*) override {
        std::printf("%s\n", text);
        return false;  // true for yes
    }
    bool restart() override { return false; }  // true when it will happen
};

void listPorts(const char* family) {
    std::list<PortResource*> ports;
    CPortResources::Instance()->getPortResources(family, ports);
    for (const PortResource* const port : ports) {
        std::printf("%s ", port->getPortName());
    }
    CPortResources::Instance()->deletePortResources(ports);
    std::printf("\n");
}

void matchIds() {
    const DeviceIdPattern anyCable = parseDeviceIdPattern("USB\\VID_12*&PID_*");
    std::printf("cable %s, modem %s\n", matchDeviceId("usb\\vid_1234&pid_0008", anyCable) ? "yes" : "no",
                matchDeviceId("ACPI\\PNP0501", anyCable) ? "yes" : "no");
}

void askForRestart() {
    AskOnTerminal restarter;
    setSystemRestarter(&restarter);
    Reboot();
    setSystemRestarter(nullptr);
}

}  // namespace

int main() {
    listPorts("USB");
    matchIds();
    askForRestart();
    CPortResources::Instance()->removeInstance();
}
