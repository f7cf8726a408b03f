// Fields and blocks over a socket and over a local stream.
//
// Each row is an exchange with an end that echoes in a thread of its own; all sides use the same kind of connection and
// differ in what moves the bytes. The rows are for hosts with BSD sockets.

#if __has_include(<sys/socket.h>)

#include <netinet/in.h>
#include <sys/socket.h>
#include <unistd.h>

#include <cstdint>
#include <thread>
#include <vector>
#if __has_include(<boost/asio.hpp>)
#include <boost/asio.hpp>
#define TESSAL_HAS_ASIO
#endif

#include "HkMessageManager.h"
#include "Item.h"
#include "TessalPipe.h"
#include "TessalSocket.h"
#include "WireForm.h"

namespace {

using State = benchmark::State;

constexpr int blockSize = 64 * 1024;

/// Two connected descriptors, closed at the end.
struct Pair {
    ~Pair() {
        ::close(ends[0]);
        ::close(ends[1]);
    }
    int ends[2] = {-1, -1};
};

struct TcpPair : Pair {
    TcpPair() {
        sockaddr_in address{};
        socklen_t length = sizeof address;
        address.sin_family = AF_INET;
        address.sin_addr.s_addr = htonl(INADDR_LOOPBACK);
        auto* const place = reinterpret_cast<sockaddr*>(&address);
        const int listener = ::socket(AF_INET, SOCK_STREAM | SOCK_CLOEXEC, 0);
        if (::bind(listener, place, length) == 0 && ::listen(listener, 1) == 0 &&
            ::getsockname(listener, place, &length) == 0) {
            ends[0] = ::socket(AF_INET, SOCK_STREAM | SOCK_CLOEXEC, 0);
            ends[1] = ::connect(ends[0], place, length) == 0 ? ::accept(listener, nullptr, nullptr) : -1;
        }
        ::close(listener);
    }
    bool isOpen() const { return ends[1] >= 0; }
};

struct LocalPair : Pair {
    LocalPair() : m_isOpen(::socketpair(AF_UNIX, SOCK_STREAM | SOCK_CLOEXEC, 0, ends) == 0) {}
    bool isOpen() const { return m_isOpen; }

private:
    bool m_isOpen;
};

// What moves the bytes. Each end is an object over a descriptor that it does not own.

class OurSocket {
public:
    using Connection = TcpPair;
    explicit OurSocket(int end) : m_end(static_cast<TessalSocket::Socket>(end)) {}
    bool read(char* data, int length) { return m_socket.read(m_end, data, length); }
    bool write(const char* data, int length) { return m_socket.write(m_end, data, length); }
    int readInt() {
        int value = 0;
        m_socket.readInt(m_end, &value);
        return value;
    }
    bool writeInt(int value) { return m_socket.writeInt(m_end, value) == WireForm::intSize; }

private:
    TessalSocket m_socket{0, "", 0};
    TessalSocket::Socket m_end;
};

class OurPipe {
public:
    using Connection = LocalPair;
    // NOLINTNEXTLINE(performance-no-int-to-ptr): a handle is a number behind a pointer
    explicit OurPipe(int end) : m_end(reinterpret_cast<void*>(static_cast<std::uintptr_t>(end))) {}
    bool read(char* data, int length) { return m_pipe.read(m_end, data, length); }
    bool write(const char* data, int length) { return m_pipe.write(m_end, data, length); }
    int readInt() {
        int value = 0;
        m_pipe.readInt(m_end, &value);
        return value;
    }
    bool writeInt(int value) { return m_pipe.writeInt(m_end, value) == WireForm::intSize; }

private:
    TessalPipe m_pipe{0, ""};
    void* m_end;
};

/// Numbers by an end's bytes, for the sides that have no fields.
template <class End>
class WithInts : public End {
public:
    using End::End;
    int readInt() {
        char bytes[WireForm::intSize] = {};
        End::read(bytes, sizeof bytes);
        return WireForm::loadInt(bytes);
    }
    bool writeInt(int value) {
        char bytes[WireForm::intSize];
        WireForm::storeInt(bytes, value);
        return End::write(bytes, sizeof bytes);
    }
};

template <class Pair>
class RawEnd {
public:
    using Connection = Pair;
    explicit RawEnd(int end) : m_end(end) {}
    bool read(char* data, int length) {
        for (ssize_t moved = 1; length > 0 && moved > 0; data += moved, length -= static_cast<int>(moved)) {
            moved = ::recv(m_end, data, static_cast<std::size_t>(length), 0);
        }
        return length == 0;
    }
    bool write(const char* data, int length) {
        for (ssize_t moved = 1; length > 0 && moved > 0; data += moved, length -= static_cast<int>(moved)) {
            moved = ::send(m_end, data, static_cast<std::size_t>(length), MSG_NOSIGNAL);
        }
        return length == 0;
    }

private:
    int m_end;
};

#ifdef TESSAL_HAS_ASIO
namespace asio = boost::asio;

template <class Protocol>
Protocol protocol();
template <>
asio::ip::tcp protocol() {
    return asio::ip::tcp::v4();
}
template <>
asio::local::stream_protocol protocol() {
    return {};
}

template <class Pair, class Protocol>
class AsioEnd {
public:
    using Connection = Pair;
    explicit AsioEnd(int end) { m_socket.assign(protocol<Protocol>(), ::dup(end)); }
    bool read(char* data, int length) {
        boost::system::error_code error;
        asio::read(m_socket, asio::buffer(data, static_cast<std::size_t>(length)), error);
        return !error;
    }
    bool write(const char* data, int length) {
        boost::system::error_code error;
        asio::write(m_socket, asio::buffer(data, static_cast<std::size_t>(length)), error);
        return !error;
    }

private:
    asio::io_context m_context;
    typename Protocol::socket m_socket{m_context};
};
#endif

/// Runs @p body with one end while the other sends back whatever @p echo takes, until this end is shut down.
template <class End, class Echo, class Body>
void withEcho(State& state, Echo echo, Body body) {
    typename End::Connection pair;
    if (!pair.isOpen()) {
        state.SkipWithError("no connection");
        return;
    }
    // The reports at the shutdown are nobody's concern.
    HkMessageManager::setHandler([](const HkMessage&, void*) {}, nullptr);
    std::thread other([&] {
        End end(pair.ends[1]);
        while (echo(end)) {
        }
    });
    {
        End end(pair.ends[0]);
        body(end);
    }
    ::shutdown(pair.ends[0], SHUT_RDWR);
    other.join();
    HkMessageManager::setHandler(nullptr, nullptr);
}

template <class End>
void echoInt(State& state) {
    // A number of 0 ends the echo: it is what a failed read gives.
    const auto echo = [](End& end) {
        const int value = end.readInt();
        return value != 0 && end.writeInt(value);
    };
    withEcho<End>(state, echo, [&](End& end) {
        int value = 1;
        for (auto _ : state) {
            if (!end.writeInt(value) || end.readInt() != value) {
                state.SkipWithError("another number came back");
                break;
            }
            value = value % 1000 + 1;
        }
    });
}

template <class End>
void echoBlock(State& state) {
    std::vector<char> block(blockSize);
    const auto echo = [&](End& end) { return end.read(block.data(), blockSize) && end.write(block.data(), blockSize); };
    withEcho<End>(state, echo, [&](End& end) {
        std::vector<char> sent(blockSize, 'x');
        std::vector<char> back(blockSize);
        bool isGood = end.write(sent.data(), blockSize) && end.read(back.data(), blockSize) && back == sent;
        for (auto _ : state) {
            isGood = isGood && end.write(sent.data(), blockSize) && end.read(back.data(), blockSize);
            benchmark::ClobberMemory();
        }
        if (!isGood) {
            state.SkipWithError("another block came back");
        }
    });
}

using RawSocket = WithInts<RawEnd<TcpPair>>;
using RawStream = WithInts<RawEnd<LocalPair>>;
#ifdef TESSAL_HAS_ASIO
using AsioSocket = WithInts<AsioEnd<TcpPair, asio::ip::tcp>>;
using AsioStream = WithInts<AsioEnd<LocalPair, asio::local::stream_protocol>>;
const std::vector<Side> socketInt = {{"asio", echoInt<AsioSocket>}};
const std::vector<Side> socketBlock = {{"asio", echoBlock<AsioSocket>}};
const std::vector<Side> pipeInt = {{"asio", echoInt<AsioStream>}};
const std::vector<Side> pipeBlock = {{"asio", echoBlock<AsioStream>}};
#else
const std::vector<Side> socketInt, socketBlock, pipeInt, pipeBlock;
#endif

const RegisterItem items[] = {
    RegisterItem{{"socket_int_echo",
                  {"TessalSocket", echoInt<OurSocket>},
                  socketInt,
                  {"send, recv", echoInt<RawSocket>},
                  1.1,
                  1.1}},
    RegisterItem{{"socket_64k_block",
                  {"TessalSocket", echoBlock<OurSocket>},
                  socketBlock,
                  {"send, recv", echoBlock<RawSocket>},
                  1.1,
                  1.1}},
    RegisterItem{
        {"pipe_int_echo", {"TessalPipe", echoInt<OurPipe>}, pipeInt, {"local stream", echoInt<RawStream>}, 1.1, 1.1}},
    RegisterItem{{"pipe_64k_block",
                  {"TessalPipe", echoBlock<OurPipe>},
                  pipeBlock,
                  {"local stream", echoBlock<RawStream>},
                  1.1,
                  1.1}},
};

}  // namespace

#endif
