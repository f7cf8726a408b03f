// Connected pairs of ends over each transport, for one suite that runs over all of them.
#pragma once

#include <gtest/gtest.h>

#include <future>
#include <memory>
#include <stdexcept>
#include <string>
#include <thread>

#include "TessalPipe.h"
#include "TessalPortMux.h"
#include "TessalSocket.h"
#include "platform/StreamSocket.h"

/// Two ends, connected, each behind a multiplexer.
struct Link {
    static constexpr std::size_t blockSize = std::size_t{3} << 20;  ///< more than the buffers between the ends hold

    TessalPortMux client{false};
    TessalPortMux server{false};
};

/// A port of this host that nobody listens on, different at each call.
inline int freshPort() {
    static unsigned next = 20000 + static_cast<unsigned>(reinterpret_cast<std::uintptr_t>(&next) / 4096) % 20000;
    return static_cast<int>(next++);
}

/// A server that listens; its port is found by trying. Throws where there is none.
inline std::unique_ptr<TessalSocket> listeningServer(int& port) {
    for (int attempt = 0; attempt < 100; ++attempt) {
        port = freshPort();
        auto server = std::make_unique<TessalSocket>(0, "", port);
        if (server->initialize()) {
            return server;
        }
    }
    throw std::runtime_error("no port for a server");
}

class SocketLink : public Link {
public:
    static constexpr const char* receiveFailure = " recv() failed: ";

    SocketLink() {
        int port = 0;
        m_server = listeningServer(port);
        m_client = std::make_unique<TessalSocket>(1, "127.0.0.1", port);
        std::future<bool> connected = std::async(std::launch::async, [&] { return m_client->initialize(); });
        m_server->setClientSocketFd(m_server->acceptClient(nullptr, nullptr));
        client.setSocketHandle(m_client.get());
        server.setSocketHandle(m_server.get());
        EXPECT_TRUE(connected.get());
    }
    ~SocketLink() { closeServerEnd(); }
    void closeServerEnd() {
        if (m_server->getClientSocketFd() != TessalSocket::noSocket) {
            m_server->closeSocket(m_server->getClientSocketFd());
            m_server->setClientSocketFd(TessalSocket::noSocket);
        }
    }

private:
    std::unique_ptr<TessalSocket> m_server;
    std::unique_ptr<TessalSocket> m_client;
};

inline std::string freshPipeName() {
    return "\\\\.\\pipe\\tessal_test_" + std::to_string(freshPort());
}

class PipeLink : public Link {
public:
    static constexpr const char* receiveFailure = "ReadFile failed: ";

    PipeLink() {
        client.selectPipe(true);
        server.selectPipe(true);
        client.setPipeHandle(&m_client);
        server.setPipeHandle(&m_server);
        EXPECT_TRUE(m_server.initialize());
        std::future<bool> connected = std::async(std::launch::async, [&] { return m_client.initialize(); });
        EXPECT_TRUE(m_server.waitForClient() && connected.get());
    }
    void closeServerEnd() { m_server.deinitialize(); }

private:
    const std::string m_name = freshPipeName();
    TessalPipe m_server{0, m_name.c_str()};
    TessalPipe m_client{1, m_name.c_str()};
};

/// This host, moving one byte a call.
class ByteByByteHost : public platform::SocketHost {
public:
    using Socket = platform::Socket;
    using Address = platform::SocketAddress;

    bool start() override { return m_real.start(); }
    void stop() override { m_real.stop(); }
    Socket openServer() override { return m_real.openServer(); }
    Socket openClient() override { return m_real.openClient(); }
    bool bindAny(Socket socket, std::uint16_t port) override { return m_real.bindAny(socket, port); }
    void listen(Socket socket, int backlog) override { m_real.listen(socket, backlog); }
    Socket accept(Socket server, sockaddr* from, int* length) override { return m_real.accept(server, from, length); }
    bool resolve(const char* name, std::uint16_t port, Address& address) override {
        return m_real.resolve(name, port, address);
    }
    bool connect(Socket socket, const Address& address) override { return m_real.connect(socket, address); }
    std::int64_t receive(Socket socket, char* data, int) override { return m_real.receive(socket, data, 1); }
    std::int64_t send(Socket socket, const char* data, int) override { return m_real.send(socket, data, 1); }
    bool close(Socket socket) override { return m_real.close(socket); }
    int lastError() override { return m_real.lastError(); }
    void pause(int milliseconds) override { m_real.pause(milliseconds); }

private:
    platform::SocketHost& m_real = platform::realSocketHost();
};

/// A host that the sockets of this process use while it lives.
template <class Host>
struct HostInPlace {
    HostInPlace() { platform::replaceSocketHost(&host); }
    ~HostInPlace() { platform::replaceSocketHost(nullptr); }
    HostInPlace(const HostInPlace&) = delete;
    HostInPlace& operator=(const HostInPlace&) = delete;

    Host host;
};

struct ByteByByteLink : private HostInPlace<ByteByByteHost>, public SocketLink {
    static constexpr std::size_t blockSize = 1000;
};

/// Sends a block to the server's end, which a thread serves, and back.
template <class LinkType>
void expectEcho(LinkType& link) {
    std::string sent(LinkType::blockSize, '\0');
    for (std::size_t i = 0; i < sent.size(); ++i) {
        sent[i] = static_cast<char>(1 + (i * 31 + i / 4096) % 255);
    }
    const int length = static_cast<int>(sent.size());
    std::thread echo([&] {
        std::string block(sent.size(), '?');
        EXPECT_TRUE(link.server.read(block.data(), length));
        EXPECT_EQ(link.server.writeString(block.c_str()), length);
    });
    EXPECT_TRUE(link.client.write(sent.data(), length));
    int announced = 0;
    link.client.readInt(&announced);
    EXPECT_EQ(announced, length);
    std::string back(sent.size(), '?');
    EXPECT_TRUE(link.client.read(back.data(), length));
    echo.join();
    EXPECT_EQ(back, sent);
}
