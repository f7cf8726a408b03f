// Intel hex: records of a length, 16 address bits, a type, data, and the two's complement of the sum of them all.
#include "imagetools/PromFormat.h"
#include "imagetools/Records.h"

namespace ImageTools {
namespace {

enum RecordType : unsigned { data = 0, endOfFile = 1, upperAddress = 4 };

constexpr std::size_t longestRecord = 1 + 2 * (4 + rowSize + 1) + 1;

void putRecord(RecordSink& sink, RecordType type, unsigned offset, const Segment& row) {
    char* to = sink.room(longestRecord);
    *to++ = ':';
    unsigned sum = 0;
    to = putNumber(to, row.size, 1, sum);
    to = putNumber(to, offset, 2, sum);
    to = putNumber(to, type, 1, sum);
    to = putRow(to, row, sum);
    to = putByte(to, 0U - sum);
    *to++ = '\n';
    sink.advance(to);
}

void putUpperAddress(RecordSink& sink, unsigned upper) {
    const unsigned char bytes[] = {static_cast<unsigned char>(upper >> 8), static_cast<unsigned char>(upper)};
    putRecord(sink, upperAddress, 0, {0, bytes, sizeof bytes});
}

}  // namespace

void writeIntelHex(const PromContent& content, RecordSink& sink) {
    unsigned upper = 0xFFFFFFFF;  // of no address, so that the first row has its upper bits told
    forEachRow(content.pieces, [&](const Segment& row) {
        const auto address = static_cast<unsigned>(row.address);
        if (address >> 16 != upper) {
            upper = address >> 16;
            putUpperAddress(sink, upper);
        }
        putRecord(sink, data, address & 0xFFFFU, row);
    });
    putRecord(sink, endOfFile, 0, {});
}

}  // namespace ImageTools
