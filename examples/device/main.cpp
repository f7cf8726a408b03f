// The simulated device: one chain, served over a pipe or TCP to one client after the other until one asks it to quit.

#include <TessalUtility.h>

#include <cstdio>
#include <cstring>
#include <memory>
#include <optional>

#include "DeviceLink.h"

namespace {

constexpr int firstFreePort = 22000;
constexpr int lastFreePort = 32000;

/// A client may be gone before it is let in; so many in a row mean that something else is wrong.
constexpr int mostFailures = 100;

constexpr char usage[] =
    "usage: tessal_device [--quit] --pipe NAME | --tcp PORT\n"
    "  --pipe NAME  serve over a pipe of this name\n"
    "  --tcp PORT   serve on this port; 0 takes a free one\n"
    "  --quit       end the device that serves there\n"
    "The address is printed when the device is ready, in the form that setcable -port takes.\n";

ChainAnswer chain() {
    ChainAnswer answer(DeviceRequest::Identify);
    answer.devices = {{"sim-prom-4m", 0x05045093}, {"sim-prom-16m", 0x05046093}, {"sim-logic", 0x02A20093}};
    return answer;
}

/// Serves a client until it closes, fails or says something else; true when it asked for the end.
bool serveClient(DeviceLink link) {
    DeviceRequest request;
    while (link.receive(request)) {
        ChainAnswer answer(request.getId());
        if (request.getId() == DeviceRequest::Identify) {
            answer = chain();
        } else if (request.getId() != DeviceRequest::Quit) {
            answer = ChainAnswer();
        }
        if (!link.send(answer) || request.getId() == DeviceRequest::Quit) {
            break;
        }
    }
    return request.getId() == DeviceRequest::Quit;
}

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

bool serveTcp(DeviceAddress address) {
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
        const bool hasEnded = serveClient(DeviceLink(*server));
        server->closeSocket(client);
        if (hasEnded) {
            return true;
        }
        failures = 0;
    }
    return false;
}

bool servePipe(const DeviceAddress& address) {
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
        if (serveClient(DeviceLink(server))) {
            return true;
        }
        failures = 0;
    }
    return false;
}

/// What the command line asks for; no address where it does not fit.
struct Call {
    std::optional<DeviceAddress> address;
    bool quits = false;
};

Call readCall(int argc, char** argv) {
    Call call;
    int next = 1;
    if (next < argc && std::strcmp(argv[next], "--quit") == 0) {
        call.quits = true;
        ++next;
    }
    if (argc - next == 2 && std::strcmp(argv[next], "--pipe") == 0) {
        call.address = DeviceAddress::read("pipe:" + std::string(argv[next + 1]));
    } else if (argc - next == 2 && std::strcmp(argv[next], "--tcp") == 0) {
        call.address = DeviceAddress::read("tcp:" + std::string(argv[next + 1]));
    }
    return call;
}

}  // namespace

int main(int argc, char** argv) {
    const Call call = readCall(argc, argv);
    if (!call.address) {
        std::fputs(usage, stderr);
        return 2;
    }
    if (call.quits) {
        ChainAnswer answer;
        return askDevice(*call.address, DeviceRequest::Quit, answer) ? 0 : 1;
    }
    const bool hasServed = call.address->pipe.empty() ? serveTcp(*call.address) : servePipe(*call.address);
    return hasServed ? 0 : 1;
}
