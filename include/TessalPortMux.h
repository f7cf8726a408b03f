/// @file
/// One front for the socket and the pipe.
#pragma once

#include "TessalExport.h"

class TessalPipe;
class TessalSocket;

/// Passes transfers on to a TessalSocket or a TessalPipe, so that the layers above need not know which carries them.
///
/// It owns neither. Handle and client socket are read from the transport at each transfer. Where the selected
/// transport was never set, transfers fail: false, or 0.
class TESSAL_API TessalPortMux {
public:
    explicit TessalPortMux(bool usePipe) : m_usePipe(usePipe) {}

    void setSocketHandle(TessalSocket* socket) { m_socket = socket; }
    void setPipeHandle(TessalPipe* pipe) { m_pipe = pipe; }
    /// True selects the pipe.
    void selectPipe(bool usePipe) { m_usePipe = usePipe; }

    // Each is the operation of the same name of the selected transport, with its handle or client socket.

    bool read(char* data, int length);
    bool write(const char* data, int length);
    int readInt(int* value);
    int writeInt(int value);
    bool readBool(bool* value);
    bool writeBool(bool value);
    int writeString(const char* text);
    bool readSocket(char* data, int length);
    bool writeSocket(const char* data, int length);

    /// Stores the client socket in the socket, whichever transport is selected.
    void setClientSocketFd(unsigned long long fd);

private:
    bool m_usePipe;
    TessalSocket* m_socket = nullptr;
    TessalPipe* m_pipe = nullptr;
};
