// The way to a simulated device: its address, and messages over a pipe or TCP.
#pragma once

#include <TessalUtility.h>

#include <optional>
#include <string>

/// Where a device serves: "pipe:NAME", or "tcp:PORT" on this machine.
struct DeviceAddress {
    /// Nothing where the text is neither form. Port 0 stands for any free one, and is for a server.
    static std::optional<DeviceAddress> read(const std::string& text);
    std::string text() const;

    std::string pipe;  ///< in the library's form; empty for TCP
    int port = 0;
};

/// Messages over one connection. A message is a string of the wire form that holds the record's text; the bytes of a
/// block may follow it.
class DeviceLink {
public:
    explicit DeviceLink(TessalSocket& socket) : m_mux(false) { m_mux.setSocketHandle(&socket); }
    explicit DeviceLink(TessalPipe& pipe) : m_mux(true) { m_mux.setPipeHandle(&pipe); }

    /// Sends the message and what follows it at once: two transfers would wait for the peer's acknowledgement.
    bool send(NetMessage& message, const unsigned char* block = nullptr, int length = 0);
    /// False where the peer is gone, announces more than a message can hold, or sends another record.
    bool receive(NetMessage& message);
    bool receiveBlock(unsigned char* block, int length);

private:
    TessalPortMux m_mux;
};
