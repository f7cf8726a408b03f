// Which piece stands for the host: the host's own, or the one that was put in its place.

#include "platform/DeviceInstaller.h"
#include "platform/HostPorts.h"
#include "platform/StreamSocket.h"
#include "platform/SystemRestart.h"

namespace platform {
namespace {

template <class Piece>
Piece* replacement = nullptr;

template <class Piece>
Piece* replacementOr(Piece* own) {
    return replacement<Piece> != nullptr ? replacement<Piece> : own;
}

}  // namespace

DeviceInstaller* deviceInstaller() {
    return replacementOr(realDeviceInstaller());
}

HostPorts& hostPorts() {
    return *replacementOr(&realHostPorts());
}

SocketHost& socketHost() {
    return *replacementOr(&realSocketHost());
}

SystemRestart* systemRestart() {
    return replacementOr(realSystemRestart());
}

void replaceDeviceInstaller(DeviceInstaller* installer) {
    replacement<DeviceInstaller> = installer;
}

void replaceHostPorts(HostPorts* ports) {
    replacement<HostPorts> = ports;
}

void replaceSocketHost(SocketHost* host) {
    replacement<SocketHost> = host;
}

void replaceSystemRestart(SystemRestart* restart) {
    replacement<SystemRestart> = restart;
}

}  // namespace platform
