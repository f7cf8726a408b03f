// One end of a conversation over TCP, for the other end in another process: one of the other host's library, or of
// another language. The client sends its fields, reads the same from the server, and both compare; peer.py has the
// bytes.
//
//     transport_peer server         prints its port, serves one client
//     transport_peer client PORT
//
// The exit status is 0 when everything arrived as it must.

#include <algorithm>
#include <cstdio>
#include <cstdlib>
#include <cstring>
#include <iterator>
#include <memory>
#include <string>

#include "TessalSocket.h"

namespace {

constexpr int firstPort = 21000;
constexpr int lastPort = 31000;
constexpr int blockSize = 1 << 18;
constexpr int numbers[] = {0x01020304, -2, -2147483647 - 1};

std::string block() {
    std::string bytes;
    for (int i = 0; i < blockSize; ++i) {
        bytes += static_cast<char>((i * 31 + i / 4096) % 256);
    }
    return bytes;
}

bool sendFields(TessalSocket& end) {
    const TessalSocket::Socket socket = end.getClientSocketFd();
    for (const int number : numbers) {
        end.writeInt(socket, number);
    }
    return end.writeBool(socket, true) && end.writeBool(socket, false) && end.writeString(socket, "ab") == 2 &&
           end.writeString(socket, nullptr) == 0 && end.writeSocket(block().data(), blockSize);
}

bool readFields(TessalSocket& end) {
    const TessalSocket::Socket socket = end.getClientSocketFd();
    const auto isNext = [&](int number) {
        int value = ~number;
        end.readInt(socket, &value);
        return value == number;
    };
    const auto isNextFlag = [&](bool flag) {
        bool value = !flag;
        return end.readBool(socket, &value) && value == flag;
    };
    const auto isNextText = [&](const std::string& text) {
        std::string bytes(text.size(), '\0');
        return end.read(socket, bytes.data(), static_cast<int>(text.size())) && bytes == text;
    };
    return std::all_of(std::begin(numbers), std::end(numbers), isNext) && isNextFlag(true) && isNextFlag(false) &&
           isNext(2) && isNextText("ab") && isNext(0) && isNextText(block());
}

int outcome(bool isGood, const char* end) {
    std::printf("%s %s\n", end, isGood ? "ok" : "failed");
    return isGood ? EXIT_SUCCESS : EXIT_FAILURE;
}

int serve() {
    std::unique_ptr<TessalSocket> server;
    int port = firstPort;
    do {
        server = std::make_unique<TessalSocket>(0, "", port);
    } while (!server->initialize() && ++port < lastPort);
    std::printf("port %d\n", port);
    std::fflush(stdout);
    server->setClientSocketFd(server->acceptClient(nullptr, nullptr));
    const bool isGood = readFields(*server) && sendFields(*server);
    server->closeSocket(server->getClientSocketFd());
    return outcome(isGood, "server");
}

int ask(int port) {
    TessalSocket client(1, "127.0.0.1", port);
    return outcome(client.connectToServer() && sendFields(client) && readFields(client), "client");
}

}  // namespace

int main(int argc, char** argv) {
    if (argc == 2 && std::strcmp(argv[1], "server") == 0) {
        return serve();
    }
    if (argc == 3 && std::strcmp(argv[1], "client") == 0) {
        return ask(std::atoi(argv[2]));
    }
    std::fputs("usage: transport_peer server | client PORT\n", stderr);
    return EXIT_FAILURE;
}
