#include "platform/LocalPipe.h"

#include <windows.h>

namespace platform {
namespace {

constexpr char prefix[] = "\\\\.\\pipe\\";
constexpr DWORD bufferSize = 1024;
constexpr DWORD defaultTimeOut = 5000;  // milliseconds

HANDLE asHandle(Pipe pipe) {
    return reinterpret_cast<HANDLE>(pipe);  // NOLINT(performance-no-int-to-ptr): a handle is a number
}

Pipe asPipe(HANDLE handle) {
    return reinterpret_cast<Pipe>(handle);
}

/// Opening any other name would create an ordinary file.
bool isPipeName(const char* name) {
    const bool is = name != nullptr && _strnicmp(name, prefix, sizeof prefix - 1) == 0 && name[sizeof prefix - 1] != 0;
    if (!is) {
        SetLastError(ERROR_INVALID_NAME);
    }
    return is;
}

class WindowsPipeHost final : public PipeHost {
public:
    // Asking for a pipe's attributes would take an instance and look like a client; waiting for one does not. The
    // time-out of 1 millisecond is the shortest there is.
    bool exists(const char* name) override {
        return isPipeName(name) && (WaitNamedPipeA(name, 1) != 0 || GetLastError() == ERROR_SEM_TIMEOUT);
    }

    Pipe create(const char* name) override {
        if (!isPipeName(name)) {
            return noPipe;
        }
        return asPipe(CreateNamedPipeA(name, PIPE_ACCESS_DUPLEX, PIPE_TYPE_BYTE | PIPE_READMODE_BYTE | PIPE_WAIT,
                                       PIPE_UNLIMITED_INSTANCES, bufferSize, bufferSize, defaultTimeOut, nullptr));
    }

    bool waitForClient(Pipe pipe) override {
        return ConnectNamedPipe(asHandle(pipe), nullptr) != 0 || GetLastError() == ERROR_PIPE_CONNECTED;
    }

    Pipe open(const char* name) override {
        if (!isPipeName(name)) {
            return noPipe;
        }
        return asPipe(CreateFileA(name, GENERIC_READ | GENERIC_WRITE, FILE_SHARE_READ | FILE_SHARE_WRITE, nullptr,
                                  OPEN_ALWAYS, FILE_ATTRIBUTE_NORMAL, nullptr));
    }

    std::int64_t read(Pipe pipe, char* data, int length) override {
        DWORD moved = 0;
        while (moved == 0) {  // a peer may have written no bytes
            if (ReadFile(asHandle(pipe), data, static_cast<DWORD>(length), &moved, nullptr) == 0) {
                return -1;
            }
        }
        return moved;
    }

    std::int64_t write(Pipe pipe, const char* data, int length) override {
        DWORD moved = 0;
        if (WriteFile(asHandle(pipe), data, static_cast<DWORD>(length), &moved, nullptr) == 0) {
            return -1;
        }
        return moved;
    }

    void close(Pipe pipe) override { CloseHandle(asHandle(pipe)); }

    int lastError() override { return static_cast<int>(GetLastError()); }
};

}  // namespace

PipeHost& pipeHost() {
    static WindowsPipeHost& host = *new WindowsPipeHost;
    return host;
}

}  // namespace platform
