// Any bytes as a stream of fields: what comes through a socket, in pieces of any size, is what a buffer in memory
// reads, and a length from the stream is never trusted.

#include <algorithm>
#include <cstdint>
#include <cstdlib>
#include <cstring>
#include <string>

#include "DataBuffer.h"
#include "HkMessageManager.h"
#include "TessalSocket.h"
#include "platform/StreamSocket.h"

namespace {

constexpr int longestText = 4096;

void require(bool condition) {
    if (!condition) {
        std::abort();
    }
}

/// A host whose only connection gives the stream in pieces of up to @p piece bytes, and then has closed.
class StreamHost final : public platform::SocketHost {
public:
    StreamHost(const char* data, int size, int piece) : m_data(data), m_size(size), m_piece(piece) {}

    bool start() override { return true; }
    void stop() override {}
    platform::Socket openServer() override { return 1; }
    platform::Socket openClient() override { return 1; }
    bool bindAny(platform::Socket, std::uint16_t) override { return true; }
    void listen(platform::Socket, int) override {}
    platform::Socket accept(platform::Socket, sockaddr*, int*) override { return 1; }
    bool resolve(const char*, std::uint16_t, platform::SocketAddress&) override { return true; }
    bool connect(platform::Socket, const platform::SocketAddress&) override { return true; }
    std::int64_t receive(platform::Socket, char* data, int length) override {
        const int moved = std::min({length, m_piece, left()});
        std::memcpy(data, m_data + m_position, static_cast<std::size_t>(moved));
        m_position += moved;
        return moved;
    }
    std::int64_t send(platform::Socket, const char*, int) override { return -1; }
    bool close(platform::Socket) override { return true; }
    int lastError() override { return 1; }
    void pause(int) override {}

    int left() const { return m_size - m_position; }

private:
    const char* m_data;
    int m_size;
    int m_piece;
    int m_position = 0;
};

/// Reads the same fields from both; each is chosen by the byte before it.
class Reader {
public:
    Reader(StreamHost& host, DataBuffer& buffer) : m_host(host), m_buffer(buffer) {}

    /// False at the end of the stream, or where a reader would give the connection up.
    bool next() {
        char kind = 0;
        if (!m_socket.read(1, &kind, 1)) {
            return false;
        }
        require(m_buffer.readByte() == kind);
        switch (kind & 3) {
            case 0:
                return number();
            case 1:
                return truth();
            default:
                return text();
        }
    }

private:
    bool number() {
        const bool complete = m_host.left() >= 4;
        int value = -1;
        require(m_socket.readInt(1, &value) == 4);
        require(value == (complete ? m_buffer.readInt() : 0));
        return complete;
    }

    bool truth() {
        bool value = false;
        if (!m_socket.readBool(1, &value)) {
            return false;
        }
        require(value == m_buffer.readBool());
        return true;
    }

    bool text() {
        const bool complete = m_host.left() >= 4;
        int length = 0;
        m_socket.readInt(1, &length);
        if (!complete || length < 0 || length > longestText) {
            return false;
        }
        require(m_buffer.readInt() == length);
        const bool isThere = m_host.left() >= length;
        std::string characters(static_cast<std::size_t>(length), '\0');
        require(m_socket.read(1, characters.data(), length) == isThere);
        for (int i = 0; isThere && i < length; ++i) {
            require(m_buffer.readByte() == characters[static_cast<std::size_t>(i)]);
        }
        return isThere;
    }

    StreamHost& m_host;
    DataBuffer& m_buffer;
    TessalSocket m_socket{0, "", 1};
};

}  // namespace

extern "C" int LLVMFuzzerTestOneInput(const std::uint8_t* data, std::size_t size) {
    if (size == 0) {
        return 0;
    }
    HkMessageManager::setHandler([](const HkMessage&, void*) {}, nullptr);
    const char* const stream = reinterpret_cast<const char*>(data) + 1;
    const int length = static_cast<int>(size - 1);
    StreamHost host(stream, length, data[0] + 1);
    platform::replaceSocketHost(&host);
    {
        DataBuffer buffer(length);
        buffer.write(stream, length);
        buffer.reset();
        Reader reader(host, buffer);
        while (reader.next()) {
            require(buffer.getLength() == length - host.left());
        }
    }
    platform::replaceSocketHost(nullptr);
    return 0;
}
