#include "platform/StreamSocket.h"

#include <winsock2.h>

#include <cstring>

namespace platform {
namespace {

static_assert(sizeof(SocketAddress) == sizeof(sockaddr_in));
static_assert(sizeof(Socket) == sizeof(SOCKET) && noSocket == INVALID_SOCKET);

constexpr WORD libraryVersion = 0x0101;

Socket keptToThisProcess(SOCKET socket) {
    if (socket != INVALID_SOCKET) {
        SetHandleInformation(reinterpret_cast<HANDLE>(socket), HANDLE_FLAG_INHERIT, 0);
    }
    return socket;
}

sockaddr_in hostForm(const SocketAddress& address) {
    sockaddr_in result{};
    std::memcpy(&result, &address, sizeof result);
    return result;
}

class WindowsSocketHost final : public SocketHost {
public:
    bool start() override {
        WSADATA data{};
        return WSAStartup(libraryVersion, &data) == 0;
    }
    void stop() override { WSACleanup(); }

    Socket openServer() override { return keptToThisProcess(::socket(AF_INET, SOCK_STREAM, 0)); }
    Socket openClient() override { return keptToThisProcess(::socket(AF_INET, SOCK_STREAM, IPPROTO_TCP)); }

    bool bindAny(Socket socket, std::uint16_t port) override {
        sockaddr_in address{};
        address.sin_family = AF_INET;
        address.sin_port = htons(port);
        address.sin_addr.s_addr = htonl(INADDR_ANY);
        return ::bind(socket, reinterpret_cast<const sockaddr*>(&address), sizeof address) == 0;
    }

    void listen(Socket socket, int backlog) override { ::listen(socket, backlog); }

    Socket accept(Socket socket, sockaddr* address, int* addressLength) override {
        return keptToThisProcess(::accept(socket, address, addressLength));
    }

    // The host takes an empty name for itself, or for any address.
    bool resolve(const char* name, std::uint16_t port, SocketAddress& address) override {
        if (name[0] == '\0') {
            WSASetLastError(WSAHOST_NOT_FOUND);
            return false;
        }
        address = {AF_INET, htons(port), ::inet_addr(name), {}};
        if (address.address != INADDR_NONE) {
            return true;
        }
        const hostent* const found = ::gethostbyname(name);
        if (found == nullptr || found->h_addr_list[0] == nullptr || found->h_length != sizeof address.address) {
            return false;
        }
        std::memcpy(&address.address, found->h_addr_list[0], sizeof address.address);
        return true;
    }

    bool connect(Socket socket, const SocketAddress& address) override {
        const sockaddr_in target = hostForm(address);
        return ::connect(socket, reinterpret_cast<const sockaddr*>(&target), sizeof target) == 0;
    }

    std::int64_t receive(Socket socket, char* data, int length) override { return ::recv(socket, data, length, 0); }
    std::int64_t send(Socket socket, const char* data, int length) override { return ::send(socket, data, length, 0); }
    bool close(Socket socket) override { return ::closesocket(socket) == 0; }

    int lastError() override { return WSAGetLastError(); }
    void pause(int milliseconds) override { Sleep(static_cast<DWORD>(milliseconds)); }
};

}  // namespace

SocketHost& realSocketHost() {
    static WindowsSocketHost& host = *new WindowsSocketHost;
    return host;
}

}  // namespace platform
