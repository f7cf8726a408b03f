/// @file
/// The named-pipe endpoint between two tool processes of one machine.
#pragma once

#include "TessalExport.h"

/// The twin of TessalSocket over a named pipe: the same roles, operation names and wire form.
///
/// The name is the host's own form: `\\.\pipe\name` on Windows; on Linux the path of a local socket, or the Windows
/// form, which stands for a socket of that name in the user's runtime directory. Only the owner's processes connect.
///
/// A server calls initialize(), waitForClient(), transfers, and deinitialize(); a client initialize(), transfers, and
/// deinitialize(). Everything blocks. Failures of a transfer are status messages with the host's error number, those
/// of setting up debug lines. An object cannot be copied: its handle is closed once. One thread at a time uses it.
class TESSAL_API TessalPipe {
public:
    /// @param role 1 for a client, any other value for a server
    /// @param pipeName copied; one of more than 127 bytes is no name and will not be found
    TessalPipe(int role, const char* pipeName);
    TessalPipe(const TessalPipe&) = delete;
    TessalPipe& operator=(const TessalPipe&) = delete;
    ~TessalPipe();

    /// As initializeSocketInClient() or initializeSocketInServer(), by the role.
    bool initialize();
    /// Creates the pipe. Where one of that name is there already, true, and nothing is created.
    bool initializeSocketInServer();
    /// Connects, in one attempt.
    bool initializeSocketInClient();
    /// True: initializeSocketInClient() has connected.
    bool connectToServer();
    /// Waits for a client; true at once where one has connected before. A failure may be tried again.
    bool waitForClient();
    /// Closes the handle; true.
    bool deinitialize();
    /// Closes the object's own handle, whatever the argument says; true.
    bool close(void* handle);

    void* getClientSocketFd() const { return m_handle; }
    void setClientSocketFd(void* handle) { m_handle = handle; }

    // As the operations of the same names of TessalSocket.

    bool read(void* handle, char* data, int length);
    bool write(void* handle, const char* data, int length);
    int readInt(void* handle, int* value);
    int writeInt(void* handle, int value);
    bool readBool(void* handle, bool* value);
    bool writeBool(void* handle, bool value);
    int writeString(void* handle, const char* text);
    /// On the object's handle; a failure is reported twice.
    bool readSocket(char* data, int length);
    bool writeSocket(const char* data, int length);

private:
    int getLastError();
    void closeHandle(const char* format);

    int m_role;
    void* m_handle;
    char m_pipeName[128] = {};
    bool m_connected = false;
};
