#include "platform/HostPorts.h"

#include "platform/InstalledPorts.h"

namespace platform {
namespace {

class WindowsPorts : public HostPorts {
public:
    HostPortList list(const std::string&) override { return installedPorts(*deviceInstaller()); }
};

}  // namespace

HostPorts& realHostPorts() {
    static WindowsPorts ports;
    return ports;
}

}  // namespace platform
