/// @file
/// The TCP endpoint between two tool processes.
#pragma once

#include <cstdint>

#include "DebugTrace.h"
#include "TessalExport.h"

struct sockaddr;

/// One end of a TCP connection over IPv4: a client that connects, or a server that listens.
///
/// The wire form is a stream of fields with nothing between them; the reader knows what follows. A number is 4 bytes,
/// least significant first; a truth value one byte, of which the lowest bit counts; a string the number of its
/// characters and then these, without a terminator; raw bytes just themselves. There is no operation that reads a
/// string: a reader takes the number, checks it against what it can hold, and takes that many bytes.
///
/// Everything blocks, and nothing is retried but the connection in connectToServer(). A transfer moves all of its
/// bytes or fails; a peer that has closed, or is gone, is a failure, with the error number 0 where the host has none.
/// Failures are status messages with the host's error number. A signal breaks no transfer, writing to a closed peer
/// ends no process, and no socket is inherited by programs that the process starts.
///
/// A server calls initialize(), acceptClient(), setClientSocketFd(), transfers, closeSocket() for the connection and
/// deinitialize(); a client initialize() or connectToServer(), transfers, and deinitialize(). An object cannot be
/// copied: its sockets are closed once. One thread at a time uses an object.
class TESSAL_API TessalSocket {
public:
    /// The host's socket descriptor.
    using Socket = std::uintptr_t;
    /// The value of no socket: all ones.
    static constexpr Socket noSocket = ~Socket{0};

    /// Does not touch the network.
    /// @param role 1 for a client, any other value for a server
    /// @param serverName name or dotted address of the server, for a client; one of more than 127 bytes is no name and
    ///        will not be resolved
    /// @param port used as 16 bits
    TessalSocket(int role, const char* serverName, int port);
    TessalSocket(const TessalSocket&) = delete;
    TessalSocket& operator=(const TessalSocket&) = delete;
    /// As deinitialize().
    ~TessalSocket();

    /// Starts the host's socket library where the object has not yet, then listens, or tries once to connect, which
    /// fails without a message.
    bool initialize();
    /// Closes the role's own socket and stops what was started; true. A server's client socket is the
    /// caller's to close.
    bool deinitialize();
    /// Closes a client's socket, waits 50 milliseconds and tries ten times to connect. Starts the socket library too,
    /// where initialize() has not.
    bool connectToServer();
    /// Waits for a client; noSocket where that fails. The two are the host's address and its length, or null.
    Socket acceptClient(sockaddr* address, int* addressLength);
    /// Closes the named socket; no field changes.
    bool closeSocket(Socket socket);

    Socket getClientSocketFd() const { return m_clientFd; }
    void setClientSocketFd(Socket socket) { m_clientFd = socket; }

    /// True when all @p length bytes came in or went out; a length below 1 is true at once.
    bool read(Socket socket, char* data, int length);
    bool write(Socket socket, const char* data, int length);
    /// 4 in any case; after a failure the value means nothing.
    int readInt(Socket socket, int* value);
    /// 4, or 0 after a failure.
    int writeInt(Socket socket, int value);
    /// A failure leaves the value alone.
    bool readBool(Socket socket, bool* value);
    bool writeBool(Socket socket, bool value);
    /// The length of the text, null counting as empty, whether or not it could be sent.
    int writeString(Socket socket, const char* text);

    // On the client socket.

    bool readSocket(char* data, int length);
    bool writeSocket(const char* data, int length);
    /// The same as writeSocket().
    bool sendStatus(const char* data, int length);

    /// Stores the low 16 bits of @p count in buffer[0] (the low byte) and buffer[1]; null is left alone.
    void setBufferCount(char* buffer, int count);

private:
    struct Address {
        std::uint16_t family;
        std::uint16_t port;
        std::uint32_t address;
        unsigned char unused[8];
    };

    char* strError(int code);
    int getLastError();
    bool startLibrary();
    bool initializeSocketInServer();
    bool initializeSocketInClient();
    bool deinitializeSocketInServer();
    bool deinitializeSocketInClient();
    bool closeField(Socket& field);
    bool isClient() const { return m_role == 1; }
    void reportFailure(const char* format, int line = __builtin_LINE());

    int m_role;
    int m_port;
    Socket m_clientFd = noSocket;
    Socket m_listenFd = noSocket;
    char m_serverName[128] = {};
    Address m_serverAddress{};
    char m_errorText[64] = {};
    DebugTrace m_trace;
    bool m_started = false;
};
