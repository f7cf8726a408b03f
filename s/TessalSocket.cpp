#include "TessalSocket.h"

#include <cstring>

#include "HkStr.h"
#include "platform/StreamSocket.h"
#include "s/FieldChannel.h"
#include "s/UnitOrigin.h"

namespace {

constexpr UnitOrigin origin{"../s/TessalSocket", "$Revision: 1.1 $"};

constexpr TransferReports reports{
    origin, " recv() failed: %d\n", " send() failed: %d\n", " writeString failed: %d.\n", nullptr, nullptr};

constexpr int backlog = 8;
constexpr int attempts = 10;
constexpr int pauseBeforeAttempts = 50;  // milliseconds

static_assert(platform::noSocket == TessalSocket::noSocket);

class SocketChannel final : public FieldChannel {
public:
    explicit SocketChannel(TessalSocket::Socket socket) : FieldChannel(reports), m_socket(socket) {}

private:
    std::int64_t receiveSome(char* data, int length) override {
        return platform::socketHost().receive(m_socket, data, length);
    }
    std::int64_t sendSome(const char* data, int length) override {
        return platform::socketHost().send(m_socket, data, length);
    }
    int failure() const override { return platform::socketHost().lastError(); }

    TessalSocket::Socket m_socket;
};

}  // namespace

TessalSocket::TessalSocket(int role, const char* serverName, int port) : m_role(role), m_port(port) {
    if (isClient() && HkStr::Len(serverName) < sizeof m_serverName) {
        HkStr::Copy(m_serverName, serverName);
    }
}

TessalSocket::~TessalSocket() {
    deinitialize();
}

bool TessalSocket::initialize() {
    if (!startLibrary()) {
        return false;
    }
    return isClient() ? initializeSocketInClient() : initializeSocketInServer();
}

bool TessalSocket::startLibrary() {
    if (!m_started && !platform::socketHost().start()) {
        origin.report().issueStatus("Failed to load Winsock!\n");
        return false;
    }
    m_started = true;
    return true;
}

bool TessalSocket::deinitialize() {
    if (isClient()) {
        deinitializeSocketInClient();
    } else {
        deinitializeSocketInServer();
    }
    if (m_started) {
        platform::socketHost().stop();
        m_started = false;
    }
    return true;
}

bool TessalSocket::initializeSocketInServer() {
    closeField(m_listenFd);
    m_listenFd = platform::socketHost().openServer();
    if (m_listenFd == noSocket) {
        reportFailure(" socket() failed: %s\n");
        return false;
    }
    if (!platform::socketHost().bindAny(m_listenFd, static_cast<std::uint16_t>(m_port))) {
        reportFailure(" bind() failed: %s\n");
        return false;
    }
    platform::socketHost().listen(m_listenFd, backlog);
    return true;
}

bool TessalSocket::initializeSocketInClient() {
    closeField(m_clientFd);
    m_clientFd = platform::socketHost().openClient();
    if (m_clientFd == noSocket) {
        reportFailure(" socket() failed: %s\n");
        return false;
    }
    platform::SocketAddress address{};
    if (!platform::socketHost().resolve(m_serverName, static_cast<std::uint16_t>(m_port), address)) {
        origin.report().issueStatus("Unable to resolve server: %s\n", m_serverName);
        return false;
    }
    static_assert(sizeof address == sizeof m_serverAddress);
    std::memcpy(&m_serverAddress, &address, sizeof address);
    return platform::socketHost().connect(m_clientFd, address);
}

bool TessalSocket::deinitializeSocketInServer() {
    closeField(m_listenFd);
    return true;
}

bool TessalSocket::deinitializeSocketInClient() {
    closeField(m_clientFd);
    return true;
}

/// Closes the socket of a field, if there is one, and empties the field.
bool TessalSocket::closeField(Socket& field) {
    if (field == noSocket) {
        return true;
    }
    const bool closed = platform::socketHost().close(field);
    if (!closed) {
        reportFailure(" closesocket() failed: %s\n");
    }
    field = noSocket;
    return closed;
}

bool TessalSocket::connectToServer() {
    if (!startLibrary()) {
        return false;
    }
    closeField(m_clientFd);
    platform::socketHost().pause(pauseBeforeAttempts);
    for (int left = attempts; left > 0; --left) {
        if (initializeSocketInClient()) {
            return true;
        }
        if (left > 1) {
            closeField(m_clientFd);
        }
    }
    reportFailure(" connect() failed: %s\n");
    return false;
}

TessalSocket::Socket TessalSocket::acceptClient(sockaddr* address, int* addressLength) {
    return platform::socketHost().accept(m_listenFd, address, addressLength);
}

bool TessalSocket::closeSocket(Socket socket) {
    return platform::socketHost().close(socket);
}

bool TessalSocket::read(Socket socket, char* data, int length) {
    return SocketChannel(socket).read(data, length);
}

bool TessalSocket::write(Socket socket, const char* data, int length) {
    return SocketChannel(socket).write(data, length);
}

int TessalSocket::readInt(Socket socket, int* value) {
    return SocketChannel(socket).readInt(value);
}

int TessalSocket::writeInt(Socket socket, int value) {
    return SocketChannel(socket).writeInt(value);
}

bool TessalSocket::readBool(Socket socket, bool* value) {
    return SocketChannel(socket).readBool(value);
}

bool TessalSocket::writeBool(Socket socket, bool value) {
    return SocketChannel(socket).writeBool(value);
}

int TessalSocket::writeString(Socket socket, const char* text) {
    return SocketChannel(socket).writeString(text);
}

bool TessalSocket::readSocket(char* data, int length) {
    return SocketChannel(m_clientFd).readSocket(data, length);
}

bool TessalSocket::writeSocket(const char* data, int length) {
    return SocketChannel(m_clientFd).writeSocket(data, length);
}

bool TessalSocket::sendStatus(const char* data, int length) {
    return writeSocket(data, length);
}

void TessalSocket::setBufferCount(char* buffer, int count) {
    if (buffer != nullptr) {
        buffer[0] = static_cast<char>(static_cast<unsigned int>(count));
        buffer[1] = static_cast<char>(static_cast<unsigned int>(count) >> 8);
    }
}

char* TessalSocket::strError(int code) {
    HkStr::SPrintf(m_errorText, "%d", code);
    return m_errorText;
}

int TessalSocket::getLastError() {
    return platform::socketHost().lastError();
}

void TessalSocket::reportFailure(const char* format, int line) {
    origin.report(line).issueStatus(format, strError(getLastError()));
}
