// Any bytes as a stream of fields: what comes through a connection, in pieces of any size, is what a buffer in memory
// reads, and a length from the stream is never trusted.
#include <algorithm>
#include <string>

#include "DataBuffer.h"
#include "fuzz/Fuzz.h"
#include "s/FieldChannel.h"

namespace {

constexpr int longestText = 4096;
constexpr TransferReports reports{{"../tests/fuzz/fuzz_fields", ""}, "%d", "%d", "%d", nullptr, nullptr};

/// A connection that gives the stream in pieces of up to @p piece bytes, and then has closed.
class MemoryChannel final : public FieldChannel {
public:
    MemoryChannel(std::string_view stream, int piece) : FieldChannel(reports), m_stream(stream), m_piece(piece) {}

    int left() const { return static_cast<int>(m_stream.size()); }

private:
    std::int64_t receiveSome(char* data, int length) override {
        const std::size_t moved = m_stream.copy(data, static_cast<std::size_t>(std::min(length, m_piece)));
        m_stream.remove_prefix(moved);
        return static_cast<std::int64_t>(moved);
    }
    std::int64_t sendSome(const char*, int) override { return -1; }
    int failure() const override { return 1; }

    std::string_view m_stream;
    int m_piece;
};

/// Reads the same fields from both; each is chosen by the byte before it.
class Reader {
public:
    Reader(MemoryChannel& channel, DataBuffer& buffer) : m_channel(channel), m_buffer(buffer) {}

    /// False at the end of the stream, or where a reader would give the connection up.
    bool next() {
        char kind = 0;
        if (!m_channel.read(&kind, 1)) {
            return false;
        }
        require(m_buffer.readByte() == kind);
        return (kind & 3) == 0 ? number() : (kind & 3) == 1 ? truth() : text();
    }

private:
    bool number() {
        const bool complete = m_channel.left() >= 4;
        int value = -1;
        require(m_channel.readInt(&value) == 4);
        require(value == (complete ? m_buffer.readInt() : 0));
        return complete;
    }

    bool truth() {
        bool value = false;
        if (!m_channel.readBool(&value)) {
            return false;
        }
        require(value == m_buffer.readBool());
        return true;
    }

    bool text() {
        const bool complete = m_channel.left() >= 4;
        int length = 0;
        m_channel.readInt(&length);
        if (!complete || length < 0 || length > longestText) {
            return false;
        }
        require(m_buffer.readInt() == length);
        const bool isThere = m_channel.left() >= length;
        std::string characters(static_cast<std::size_t>(length), '\0');
        require(m_channel.read(characters.data(), length) == isThere);
        for (int i = 0; isThere && i < length; ++i) {
            require(m_buffer.readByte() == characters[static_cast<std::size_t>(i)]);
        }
        return isThere;
    }

    MemoryChannel& m_channel;
    DataBuffer& m_buffer;
};

}  // namespace

void fuzz(Input input) {
    const int piece = static_cast<int>(input.byte()) + 1;
    MemoryChannel channel(input.bytes(), piece);
    const int length = channel.left();
    DataBuffer buffer(length);
    buffer.write(input.bytes().data(), length);
    buffer.reset();
    Reader reader(channel, buffer);
    while (reader.next()) {
        require(buffer.getLength() == length - channel.left());
    }
}
