#include "platform/HostPorts.h"

namespace platform {
namespace {

HostPorts* replacement = nullptr;

}  // namespace

HostPorts& hostPorts() {
    return replacement != nullptr ? *replacement : realHostPorts();
}

void replaceHostPorts(HostPorts* ports) {
    replacement = ports;
}

}  // namespace platform
