#include "TessalPortMux.h"

#include "TessalPipe.h"
#include "TessalSocket.h"

namespace {

/// Calls the operation on the selected transport; gives a zero result where that was never set.
template <class Operation>
auto onTransport(bool usePipe, TessalPipe* pipe, TessalSocket* socket, Operation operation) {
    using Result = decltype(operation(*socket));
    if (usePipe) {
        return pipe != nullptr ? operation(*pipe) : Result{};
    }
    return socket != nullptr ? operation(*socket) : Result{};
}

}  // namespace

bool TessalPortMux::read(char* data, int length) {
    return onTransport(m_usePipe, m_pipe, m_socket,
                       [=](auto& transport) { return transport.read(transport.getClientSocketFd(), data, length); });
}

bool TessalPortMux::write(const char* data, int length) {
    return onTransport(m_usePipe, m_pipe, m_socket,
                       [=](auto& transport) { return transport.write(transport.getClientSocketFd(), data, length); });
}

int TessalPortMux::readInt(int* value) {
    return onTransport(m_usePipe, m_pipe, m_socket,
                       [=](auto& transport) { return transport.readInt(transport.getClientSocketFd(), value); });
}

int TessalPortMux::writeInt(int value) {
    return onTransport(m_usePipe, m_pipe, m_socket,
                       [=](auto& transport) { return transport.writeInt(transport.getClientSocketFd(), value); });
}

bool TessalPortMux::readBool(bool* value) {
    return onTransport(m_usePipe, m_pipe, m_socket,
                       [=](auto& transport) { return transport.readBool(transport.getClientSocketFd(), value); });
}

bool TessalPortMux::writeBool(bool value) {
    return onTransport(m_usePipe, m_pipe, m_socket,
                       [=](auto& transport) { return transport.writeBool(transport.getClientSocketFd(), value); });
}

int TessalPortMux::writeString(const char* text) {
    return onTransport(m_usePipe, m_pipe, m_socket,
                       [=](auto& transport) { return transport.writeString(transport.getClientSocketFd(), text); });
}

bool TessalPortMux::readSocket(char* data, int length) {
    return onTransport(m_usePipe, m_pipe, m_socket,
                       [=](auto& transport) { return transport.readSocket(data, length); });
}

bool TessalPortMux::writeSocket(const char* data, int length) {
    return onTransport(m_usePipe, m_pipe, m_socket,
                       [=](auto& transport) { return transport.writeSocket(data, length); });
}

void TessalPortMux::setClientSocketFd(unsigned long long fd) {
    if (m_socket != nullptr) {
        m_socket->setClientSocketFd(fd);
    }
}
