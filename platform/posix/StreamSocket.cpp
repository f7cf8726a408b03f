#include "platform/StreamSocket.h"

#include <arpa/inet.h>
#include <netdb.h>
#include <netinet/in.h>
#include <poll.h>
#include <sys/socket.h>
#include <unistd.h>

#include <algorithm>
#include <cerrno>
#include <chrono>
#include <climits>
#include <cstring>
#include <memory>
#include <thread>

#include "platform/posix/Retry.h"

namespace platform {
namespace {

static_assert(sizeof(SocketAddress) == sizeof(sockaddr_in));

int descriptor(Socket socket) {
    return socket <= INT_MAX ? static_cast<int>(socket) : -1;
}

Socket asSocket(int number) {
    return number >= 0 ? static_cast<Socket>(number) : noSocket;
}

Socket acceptOn(Socket server, sockaddr* address, socklen_t* length) {
    return asSocket(retried([&] { return ::accept4(descriptor(server), address, length, SOCK_CLOEXEC); }));
}

sockaddr_in hostForm(const SocketAddress& address) {
    sockaddr_in result{};
    std::memcpy(&result, &address, sizeof result);
    return result;
}

/// A connect that a signal interrupted goes on by itself; its outcome is to be waited for, not asked for again.
bool finishConnect(int number) {
    pollfd waited{number, POLLOUT, 0};
    if (retried([&] { return ::poll(&waited, 1, -1); }) != 1) {
        return false;
    }
    int error = 0;
    socklen_t length = sizeof error;
    if (::getsockopt(number, SOL_SOCKET, SO_ERROR, &error, &length) != 0) {
        return false;
    }
    errno = error;
    return error == 0;
}

bool findName(const char* name, in_addr_t& address) {
    addrinfo wanted{};
    wanted.ai_family = AF_INET;
    wanted.ai_socktype = SOCK_STREAM;
    addrinfo* found = nullptr;
    if (::getaddrinfo(name, nullptr, &wanted, &found) != 0 || found == nullptr) {
        return false;
    }
    const std::unique_ptr<addrinfo, decltype(&::freeaddrinfo)> list(found, &::freeaddrinfo);
    sockaddr_in first{};
    std::memcpy(&first, list->ai_addr, sizeof first);
    address = first.sin_addr.s_addr;
    return true;
}

class PosixSocketHost final : public SocketHost {
public:
    bool start() override { return true; }
    void stop() override {}

    Socket openServer() override { return asSocket(::socket(AF_INET, SOCK_STREAM | SOCK_CLOEXEC, 0)); }
    Socket openClient() override { return asSocket(::socket(AF_INET, SOCK_STREAM | SOCK_CLOEXEC, IPPROTO_TCP)); }

    bool bindAny(Socket socket, std::uint16_t port) override {
        sockaddr_in address{};
        address.sin_family = AF_INET;
        address.sin_port = htons(port);
        address.sin_addr.s_addr = htonl(INADDR_ANY);
        return ::bind(descriptor(socket), reinterpret_cast<const sockaddr*>(&address), sizeof address) == 0;
    }

    void listen(Socket socket, int backlog) override { ::listen(descriptor(socket), backlog); }

    Socket accept(Socket socket, sockaddr* address, int* addressLength) override {
        if (address == nullptr || addressLength == nullptr) {
            return acceptOn(socket, nullptr, nullptr);
        }
        auto length = static_cast<socklen_t>(std::max(*addressLength, 0));
        const Socket accepted = acceptOn(socket, address, &length);
        if (accepted != noSocket) {
            *addressLength = static_cast<int>(length);
        }
        return accepted;
    }

    bool resolve(const char* name, std::uint16_t port, SocketAddress& address) override {
        in_addr_t number = ::inet_addr(name);
        if (number == INADDR_NONE && !findName(name, number)) {
            return false;
        }
        address = {AF_INET, htons(port), number, {}};
        return true;
    }

    bool connect(Socket socket, const SocketAddress& address) override {
        const sockaddr_in target = hostForm(address);
        const int number = descriptor(socket);
        return ::connect(number, reinterpret_cast<const sockaddr*>(&target), sizeof target) == 0 ||
               (errno == EINTR && finishConnect(number));
    }

    // Whoever reads wants all the bytes: waiting for all of them wakes it once for a block, not for each part of it.
    std::int64_t receive(Socket socket, char* data, int length) override {
        return retried([&] { return ::recv(descriptor(socket), data, static_cast<std::size_t>(length), MSG_WAITALL); });
    }

    std::int64_t send(Socket socket, const char* data, int length) override {
        return retried(
            [&] { return ::send(descriptor(socket), data, static_cast<std::size_t>(length), MSG_NOSIGNAL); });
    }

    bool close(Socket socket) override { return ::close(descriptor(socket)) == 0 || errno == EINTR; }

    int lastError() override { return errno; }

    void pause(int milliseconds) override { std::this_thread::sleep_for(std::chrono::milliseconds(milliseconds)); }
};

}  // namespace

SocketHost& realSocketHost() {
    static PosixSocketHost& host = *new PosixSocketHost;
    return host;
}

}  // namespace platform
