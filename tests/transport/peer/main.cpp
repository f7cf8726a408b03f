// One end of a conversation over TCP, for the other end in another process: one of the other host's library, or of
// another language. Each end sends the same fields in its turn, and reads what it gets both as fields and as bytes.
//
//     transport_peer server         prints its port, serves one client
//     transport_peer client PORT
//
// The exit status is 0 when everything arrived as it must.

#include <algorithm>
#include <cstdio>
#include <cstdlib>
#include <cstring>
#include <memory>
#include <string>

#include "DataBuffer.h"
#include "TessalSocket.h"

namespace {

using namespace std::string_literals;

constexpr int firstPort = 21000;
constexpr int lastPort = 31000;
constexpr int blockSize = 1 << 18;

/// The fields as they must be on the wire, told byte by byte, and a block behind them.
std::string expectedBytes() {
    std::string bytes = "\4\3\2\1\xFE\xFF\xFF\xFF\0\0\0\x80\1\0\2\0\0\0ab\0\0\0\0"s;
    for (int i = 0; i < blockSize; ++i) {
        bytes += static_cast<char>((i * 31 + i / 4096) % 256);
    }
    return bytes;
}

class Conversation {
public:
    explicit Conversation(TessalSocket& transport) : m_transport(transport), m_socket(transport.getClientSocketFd()) {}

    /// Field by field.
    bool sendFields() {
        int sent = 0;
        for (const int number : {0x01020304, -2, -2147483647 - 1}) {
            sent += m_transport.writeInt(m_socket, number);
        }
        return sent == 12 && m_transport.writeBool(m_socket, true) && m_transport.writeBool(m_socket, false) &&
               m_transport.writeString(m_socket, "ab") == 2 && m_transport.writeString(m_socket, nullptr) == 0 &&
               m_transport.writeSocket(block(), blockSize);
    }

    /// The same, laid out in memory and sent whole.
    bool sendBuffer() {
        DataBuffer buffer(0);
        for (const int number : {0x01020304, -2, -2147483647 - 1}) {
            buffer.writeInt(number);
        }
        buffer.writeBool(true);
        buffer.writeBool(false);
        buffer.writeString("ab");
        buffer.writeString(nullptr);
        buffer.write(block(), blockSize);
        return m_transport.writeSocket(buffer.getBuffer(), buffer.getLength());
    }

    bool readFields() {
        bool matches = true;
        for (const int number : {0x01020304, -2, -2147483647 - 1}) {
            matches = matches && nextInt() == number;
        }
        bool first = false;
        bool second = true;
        matches = matches && m_transport.readBool(m_socket, &first) && m_transport.readBool(m_socket, &second);
        matches = matches && first && !second && nextInt() == 2 && nextBytes(2) == "ab" && nextInt() == 0;
        return matches && nextBytes(blockSize) == m_expected.substr(m_expected.size() - blockSize);
    }

    bool readBytes() { return nextBytes(static_cast<int>(m_expected.size())) == m_expected; }

private:
    const char* block() const { return m_expected.data() + m_expected.size() - blockSize; }

    int nextInt() {
        int value = 0;
        m_transport.readInt(m_socket, &value);
        return value;
    }

    std::string nextBytes(int length) {
        std::string bytes(static_cast<std::size_t>(length), '\0');
        return m_transport.read(m_socket, bytes.data(), length) ? bytes : "";
    }

    TessalSocket& m_transport;
    TessalSocket::Socket m_socket;
    std::string m_expected = expectedBytes();
};

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
    Conversation talk(*server);
    const bool isGood = talk.readBytes() && talk.sendFields() && talk.readFields() && talk.sendBuffer();
    server->closeSocket(server->getClientSocketFd());
    return outcome(isGood, "server");
}

int ask(int port) {
    TessalSocket client(1, "127.0.0.1", port);
    if (!client.connectToServer()) {
        return outcome(false, "client");
    }
    Conversation talk(client);
    return outcome(talk.sendFields() && talk.readBytes() && talk.sendBuffer() && talk.readFields(), "client");
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
