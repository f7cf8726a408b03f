// Motorola S-records: a type, the number of bytes that follow, an address of 2 to 4 bytes, data, and the one's
// complement of the sum.
#include "imagetools/PromFormat.h"
#include "imagetools/Records.h"

namespace ImageTools {
namespace {

constexpr unsigned longestTitle = 252;
constexpr std::size_t longestRecord = 2 + 2 * 256 + 1;

/// The kinds of file by the width of their addresses.
struct Kind {
    unsigned addressBytes;
    char data;
    char end;
};

constexpr Kind kinds[] = {{2, '1', '9'}, {3, '2', '8'}, {4, '3', '7'}};

/// The narrowest kind that reaches the last byte.
const Kind& kindFor(std::uint64_t end) {
    if (end <= 0x10000) {
        return kinds[0];
    }
    return end <= 0x1000000 ? kinds[1] : kinds[2];
}

void putRecord(RecordSink& sink, char type, unsigned addressBytes, const Segment& row) {
    char* to = sink.room(longestRecord);
    *to++ = 'S';
    *to++ = type;
    unsigned sum = 0;
    to = putNumber(to, addressBytes + row.size + 1, 1, sum);
    to = putNumber(to, row.address, addressBytes, sum);
    to = putRow(to, row, sum);
    to = putByte(to, ~sum);
    *to++ = '\n';
    sink.advance(to);
}

/// The number of data records, where a record can hold it.
void putCount(RecordSink& sink, std::uint64_t count) {
    if (count <= 0xFFFF) {
        putRecord(sink, '5', 2, {count, nullptr, 0});
    } else if (count <= 0xFFFFFF) {
        putRecord(sink, '6', 3, {count, nullptr, 0});
    }
}

}  // namespace

void writeMotorolaRecords(const PromContent& content, RecordSink& sink) {
    const Kind& kind = kindFor(content.end());
    const auto* const title = reinterpret_cast<const unsigned char*>(content.title.data());
    putRecord(sink, '0', 2, {0, title, std::min<std::size_t>(content.title.size(), longestTitle)});
    std::uint64_t count = 0;
    forEachRow(content.pieces, [&](const Segment& row) {
        putRecord(sink, kind.data, kind.addressBytes, row);
        ++count;
    });
    putCount(sink, count);
    putRecord(sink, kind.end, kind.addressBytes, {});
}

}  // namespace ImageTools
