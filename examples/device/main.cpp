// The simulated device: one chain, served over a pipe or TCP to one client after the other until one asks it to quit.

#include <TessalUtility.h>

#include <cstdio>
#include <exception>
#include <memory>

#include "DeviceCall.h"
#include "DeviceClient.h"

namespace {

constexpr int firstFreePort = 22000;
constexpr int lastFreePort = 32000;

/// A client may be gone before it is let in; so many in a row mean that something else is wrong.
constexpr int mostFailures = 100;

/// Clients come and go: what their connections report is of no interest here.
void beReady(const DeviceAddress& address) {
    std::printf("%s\n", address.text().c_str());
    std::fflush(stdout);
    HkMessageManager::setHandler([](const HkMessage&, void*) {}, nullptr);
}

std::unique_ptr<TessalSocket> listenAt(DeviceAddress& address) {
    const bool isFree = address.port == 0;
    const int last = isFree ? lastFreePort : address.port;
    for (address.port = isFree ? firstFreePort : address.port; address.port <= last; ++address.port) {
        auto server = std::make_unique<TessalSocket>(0, "", address.port);
        if (server->initialize()) {
            return server;
        }
    }
    return nullptr;
}

bool serveTcp(DeviceAddress address, SimulatedChain& chain) {
    const std::unique_ptr<TessalSocket> server = listenAt(address);
    if (server == nullptr) {
        return false;
    }
    beReady(address);
    for (int failures = 0; failures < mostFailures; ++failures) {
        const TessalSocket::Socket client = server->acceptClient(nullptr, nullptr);
        if (client == TessalSocket::noSocket) {
            continue;
        }
        server->setClientSocketFd(client);
        DeviceLink link(*server);
        const bool hasEnded = chain.serve(link);
        server->closeSocket(client);
        if (hasEnded) {
            return true;
        }
        failures = 0;
    }
    return false;
}

bool servePipe(const DeviceAddress& address, SimulatedChain& chain) {
    bool isReady = false;
    for (int failures = 0; failures < mostFailures; ++failures) {
        TessalPipe server(0, address.pipe.c_str());  // an end is for one client
        if (!server.initialize()) {
            std::fprintf(stderr, "tessal_device: no pipe can be made at %s\n", address.text().c_str());
            return false;
        }
        if (!isReady) {
            beReady(address);
            isReady = true;
        }
        if (!server.waitForClient()) {
            continue;
        }
        DeviceLink link(server);
        if (chain.serve(link)) {
            return true;
        }
        failures = 0;
    }
    return false;
}

int run(int argc, char** argv) {
    const DeviceCall call = readDeviceCall(argc, argv);
    if (call.isHelp) {
        std::fputs(deviceCallHelp().c_str(), stdout);
        return 0;
    }
    if (!call.address) {
        return 2;
    }
    if (call.isQuit) {
        DeviceClient device(*call.address);
        return device.isConnected() && device.quit() ? 0 : 1;
    }
    SimulatedChain chain(call.contentFile, call.faults);
    const bool hasServed =
        call.address->pipe.empty() ? serveTcp(*call.address, chain) : servePipe(*call.address, chain);
    return hasServed ? 0 : 1;
}

}  // namespace

int main(int argc, char** argv) {
    try {
        return run(argc, argv);
    } catch (const std::exception& exception) {
        std::fprintf(stderr, "tessal_device: %s\n", exception.what());
        return 1;
    }
}
