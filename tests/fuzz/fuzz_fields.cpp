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

// Each reads the same field from both; false at the end of the stream, or where a reader would give the connection up.

bool readNumber(MemoryChannel& channel, DataBuffer& buffer, int& value) {
    const bool isWhole = channel.left() >= 4;
    require(channel.readInt(&value) == 4);
    require(value == (isWhole ? buffer.readInt() : 0));
    return isWhole;
}

bool readTruth(MemoryChannel& channel, DataBuffer& buffer) {
    bool value = false;
    const bool isWhole = channel.readBool(&value);
    require(!isWhole || value == buffer.readBool());
    return isWhole;
}

bool readText(MemoryChannel& channel, DataBuffer& buffer) {
    int length = 0;
    if (!readNumber(channel, buffer, length) || length < 0 || length > longestText) {
        return false;
    }
    const bool isWhole = channel.left() >= length;
    std::string characters(static_cast<std::size_t>(length), '\0');
    require(channel.read(characters.data(), length) == isWhole);
    for (int i = 0; isWhole && i < length; ++i) {
        require(buffer.readByte() == characters[static_cast<std::size_t>(i)]);
    }
    return isWhole;
}

}  // namespace

void fuzz(Input input) {
    const int piece = static_cast<int>(input.byte()) + 1;
    MemoryChannel channel(input.bytes(), piece);
    const int length = channel.left();
    DataBuffer buffer(length);
    buffer.write(input.bytes().data(), length);
    buffer.reset();
    for (char kind = 0; channel.read(&kind, 1);) {  // it chooses the field that follows
        require(buffer.readByte() == kind);
        int value = -1;
        const bool isWhole = (kind & 2) != 0   ? readText(channel, buffer)
                             : (kind & 1) != 0 ? readTruth(channel, buffer)
                                               : readNumber(channel, buffer, value);
        if (!isWhole) {
            return;
        }
        require(buffer.getLength() == length - channel.left());
    }
}
