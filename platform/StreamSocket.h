// The host's TCP sockets over IPv4, blocking, without options.
//
// No call ends the process or is broken by a signal, and no socket is inherited by programs that the process starts.
// A call that fails says so, and lastError() gives the host's number for it until the next call of the same thread.
#pragma once

#include <cstdint>

struct sockaddr;

namespace platform {

using Socket = std::uintptr_t;
constexpr Socket noSocket = ~Socket{0};

/// An IPv4 address and port as the host lays it out; port and address in network order.
struct SocketAddress {
    std::uint16_t family;
    std::uint16_t port;
    std::uint32_t address;
    unsigned char unused[8];
};

/// Tests put another one in place.
class SocketHost {
public:
    virtual ~SocketHost() = default;

    /// Brings the host's socket library up; calls count, and each that gave true is answered by one stop().
    virtual bool start() = 0;
    virtual void stop() = 0;

    virtual Socket openServer() = 0;
    virtual Socket openClient() = 0;
    /// Every address of the host at the port; false also where the port is in use.
    virtual bool bindAny(Socket socket, std::uint16_t port) = 0;
    virtual void listen(Socket socket, int backlog) = 0;
    /// Blocks until a client comes; noSocket where that fails. The two may be null.
    virtual Socket accept(Socket socket, sockaddr* address, int* addressLength) = 0;
    /// Finds the address of a name or of four numbers with dots; false where there is none.
    virtual bool resolve(const char* name, std::uint16_t port, SocketAddress& address) = 0;
    /// Blocks until the server answered or the host gave up.
    virtual bool connect(Socket socket, const SocketAddress& address) = 0;
    /// Number of bytes moved, 0 where the peer has closed, -1 for a failure.
    virtual std::int64_t receive(Socket socket, char* data, int length) = 0;
    virtual std::int64_t send(Socket socket, const char* data, int length) = 0;
    virtual bool close(Socket socket) = 0;

    virtual int lastError() = 0;
    virtual void pause(int milliseconds) = 0;
};

/// The one in use.
SocketHost& socketHost();
/// Puts another one in its place; null restores the host's own. Not while sockets are in use.
void replaceSocketHost(SocketHost* host);

/// The host's own.
SocketHost& realSocketHost();

}  // namespace platform
