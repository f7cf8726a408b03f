// Connected pairs of ends over each transport, for one suite that runs over all of them.
#pragma once

#include <gtest/gtest.h>

#include <deque>
#include <future>
#include <memory>
#include <string>

#include "TessalPipe.h"
#include "TessalPortMux.h"
#include "TessalSocket.h"
#include "platform/StreamSocket.h"

/// Two ends, each behind a multiplexer.
class Link {
public:
    virtual ~Link() = default;
    /// Sets the connection up; false is a failed test.
    virtual bool connect() = 0;
    virtual void closeServerEnd() = 0;
    virtual const char* receiveFailure() const = 0;
    /// True when both ends may be used at once by two threads.
    virtual bool isConcurrent() const { return true; }

    TessalPortMux client{false};
    TessalPortMux server{false};
};

/// A port of this host that nobody listens on, different at each call.
inline int freshPort() {
    static unsigned next = 20000 + static_cast<unsigned>(reinterpret_cast<std::uintptr_t>(&next) / 4096) % 20000;
    return static_cast<int>(next++);
}

/// A server that listens; its port is found by trying.
inline std::unique_ptr<TessalSocket> listeningServer(int& port) {
    for (int attempt = 0; attempt < 100; ++attempt) {
        port = freshPort();
        auto server = std::make_unique<TessalSocket>(0, "", port);
        if (server->initialize()) {
            return server;
        }
    }
    return nullptr;
}

class SocketLink : public Link {
public:
    bool connect() override {
        int port = 0;
        m_server = listeningServer(port);
        if (m_server == nullptr) {
            return false;
        }
        m_client = std::make_unique<TessalSocket>(1, "127.0.0.1", port);
        std::future<bool> connected = std::async(std::launch::async, [&] { return m_client->initialize(); });
        m_server->setClientSocketFd(m_server->acceptClient(nullptr, nullptr));
        client.setSocketHandle(m_client.get());
        server.setSocketHandle(m_server.get());
        return connected.get() && m_server->getClientSocketFd() != TessalSocket::noSocket;
    }
    ~SocketLink() override { SocketLink::closeServerEnd(); }
    void closeServerEnd() override {
        if (m_server != nullptr && m_server->getClientSocketFd() != TessalSocket::noSocket) {
            m_server->closeSocket(m_server->getClientSocketFd());
            m_server->setClientSocketFd(TessalSocket::noSocket);
        }
    }
    const char* receiveFailure() const override { return " recv() failed: "; }

private:
    std::unique_ptr<TessalSocket> m_server;
    std::unique_ptr<TessalSocket> m_client;
};

inline std::string freshPipeName() {
    return "\\\\.\\pipe\\tessal_test_" + std::to_string(freshPort());
}

class PipeLink : public Link {
public:
    bool connect() override {
        const std::string name = freshPipeName();
        m_server = std::make_unique<TessalPipe>(0, name.c_str());
        m_client = std::make_unique<TessalPipe>(1, name.c_str());
        client.selectPipe(true);
        server.selectPipe(true);
        client.setPipeHandle(m_client.get());
        server.setPipeHandle(m_server.get());
        if (!m_server->initialize()) {
            return false;
        }
        std::future<bool> connected = std::async(std::launch::async, [&] { return m_client->initialize(); });
        return m_server->waitForClient() && connected.get();
    }
    void closeServerEnd() override { m_server->deinitialize(); }
    const char* receiveFailure() const override { return "ReadFile failed: "; }

private:
    std::unique_ptr<TessalPipe> m_server;
    std::unique_ptr<TessalPipe> m_client;
};

/// A host without a network that moves one byte a call.
class ByteByByteHost : public platform::SocketHost {
public:
    bool start() override { return true; }
    void stop() override {}
    platform::Socket openServer() override { return 0; }
    platform::Socket openClient() override { return 1; }
    bool bindAny(platform::Socket, std::uint16_t) override { return true; }
    void listen(platform::Socket, int) override {}
    platform::Socket accept(platform::Socket, sockaddr*, int*) override { return 2; }
    bool resolve(const char*, std::uint16_t, platform::SocketAddress&) override { return true; }
    bool connect(platform::Socket, const platform::SocketAddress&) override { return true; }
    std::int64_t receive(platform::Socket socket, char* data, int) override {
        std::deque<char>& way = m_ways[socket % 2];
        if (way.empty()) {
            return 0;
        }
        *data = way.front();
        way.pop_front();
        return 1;
    }
    std::int64_t send(platform::Socket socket, const char* data, int) override {
        if (m_closed) {
            return -1;
        }
        m_ways[1 - socket % 2].push_back(*data);
        return 1;
    }
    bool close(platform::Socket) override {
        m_closed = true;
        return true;
    }
    int lastError() override { return 104; }
    void pause(int) override {}

private:
    std::deque<char> m_ways[2];
    bool m_closed = false;
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

class ByteByByteLink : private HostInPlace<ByteByByteHost>, public SocketLink {
public:
    bool isConcurrent() const override { return false; }
};
