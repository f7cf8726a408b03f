#include "platform/LocalPipe.h"

#include <fcntl.h>
#include <sys/socket.h>
#include <sys/stat.h>
#include <sys/un.h>
#include <unistd.h>

#include <cerrno>
#include <climits>
#include <cstring>
#include <string>

#include "platform/posix/Descriptor.h"
#include "platform/posix/PipeLock.h"
#include "platform/posix/PipeName.h"
#include "platform/posix/Retry.h"

namespace platform {
namespace {

int descriptor(Pipe pipe) {
    return pipe <= INT_MAX ? static_cast<int>(pipe) : -1;
}

Descriptor newSocket() {
    return Descriptor(::socket(AF_UNIX, SOCK_STREAM | SOCK_CLOEXEC, 0));
}

sockaddr_un addressOf(const std::string& path) {
    sockaddr_un address{};
    address.sun_family = AF_UNIX;
    std::memcpy(address.sun_path, path.c_str(), path.size() + 1);
    return address;
}

bool bindTo(const Descriptor& socket, const std::string& path) {
    const sockaddr_un address = addressOf(path);
    return ::bind(socket.get(), reinterpret_cast<const sockaddr*>(&address), sizeof address) == 0;
}

/// Makes the socket listen under the path. It comes to its name whole: bound under another one, closed to others and
/// listening, it replaces at once what a killed server has left. The caller holds the path's lock.
bool publish(const Descriptor& socket, const std::string& path) {
    constexpr int oneClient = 0;
    const std::string unfinished = path + ".new";
    ::unlink(unfinished.c_str());
    if (!bindTo(socket, unfinished)) {
        return false;
    }
    if (::chmod(unfinished.c_str(), 0600) == 0 && ::listen(socket.get(), oneClient) == 0 &&
        ::rename(unfinished.c_str(), path.c_str()) == 0) {
        return true;
    }
    const int error = errno;
    ::unlink(unfinished.c_str());
    errno = error;
    return false;
}

/// What a killed server may have left is replaced; anything else under the name stays and keeps it taken.
bool isFreeForSocket(const std::string& path) {
    struct stat status {};
    if (::lstat(path.c_str(), &status) != 0) {
        return errno == ENOENT;
    }
    if (S_ISSOCK(status.st_mode)) {
        return true;
    }
    errno = EEXIST;
    return false;
}

class PosixPipeHost final : public PipeHost {
public:
    bool exists(const char* name) override {
        const std::string path = pipePath(name);
        return !path.empty() && isPipeLocked(path);
    }

    Pipe create(const char* name) override {
        const std::string path = pipePath(name);
        Descriptor socket = path.empty() ? Descriptor() : newSocket();
        if (!socket.isOpen() || !isFreeForSocket(path) || !holdPipeLock(socket.get(), path)) {
            return noPipe;
        }
        if (!publish(socket, path)) {
            const int error = errno;
            dropPipeLock(socket.get());
            errno = error;
            return noPipe;
        }
        return static_cast<Pipe>(socket.release());
    }

    // The connection takes the place of the listening socket under the same number, so that the handle stays what it
    // was and nobody else is let in.
    bool waitForClient(Pipe pipe) override {
        const int number = descriptor(pipe);
        const Descriptor connection(retried([&] { return ::accept4(number, nullptr, nullptr, SOCK_CLOEXEC); }));
        return connection.isOpen() && retried([&] { return ::dup3(connection.get(), number, O_CLOEXEC); }) >= 0;
    }

    // A server end has room for one client; connecting to one that is taken must fail, not wait.
    Pipe open(const char* name) override {
        const std::string path = pipePath(name);
        Descriptor socket = path.empty() ? Descriptor() : newSocket();
        if (!socket.isOpen()) {
            return noPipe;
        }
        const sockaddr_un address = addressOf(path);
        const int flags = ::fcntl(socket.get(), F_GETFL);
        if (::fcntl(socket.get(), F_SETFL, flags | O_NONBLOCK) != 0 ||
            ::connect(socket.get(), reinterpret_cast<const sockaddr*>(&address), sizeof address) != 0 ||
            ::fcntl(socket.get(), F_SETFL, flags) != 0) {
            return noPipe;
        }
        return static_cast<Pipe>(socket.release());
    }

    // Whoever reads wants all the bytes: waiting for all of them wakes it once for a block, not for each part of it.
    std::int64_t read(Pipe pipe, char* data, int length) override {
        const ssize_t moved =
            retried([&] { return ::recv(descriptor(pipe), data, static_cast<std::size_t>(length), MSG_WAITALL); });
        return closedIsBroken(moved);
    }

    std::int64_t write(Pipe pipe, const char* data, int length) override {
        const ssize_t moved =
            retried([&] { return ::send(descriptor(pipe), data, static_cast<std::size_t>(length), MSG_NOSIGNAL); });
        return closedIsBroken(moved);
    }

    void close(Pipe pipe) override {
        dropPipeLock(descriptor(pipe));
        ::close(descriptor(pipe));
    }

    int lastError() override { return errno; }

private:
    /// A pipe whose other end has closed is a broken one.
    static std::int64_t closedIsBroken(ssize_t moved) {
        if (moved != 0) {
            return moved;
        }
        errno = EPIPE;
        return -1;
    }
};

}  // namespace

PipeHost& pipeHost() {
    static PosixPipeHost& host = *new PosixPipeHost;
    return host;
}

}  // namespace platform
