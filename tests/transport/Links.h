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

/// Two ends, connected, each behind a multiplexer.
struct Link {
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
        client.setSocketHandle(m_client.get());
        server.setSocketHandle(m_server.get());
        server.setClientSocketFd(m_server->acceptClient(nullptr, nullptr));
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

/// Sends a block, which is more than the buffers between the ends hold, to the server's end, which a thread serves, and
/// back.
inline void expectEcho(Link& link) {
    std::string sent(std::size_t{3} << 20, '\0');
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
