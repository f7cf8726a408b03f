// Raw hex and raw binary: the bytes in address order, without addresses.
#include "imagetools/PromFormat.h"
#include "imagetools/Records.h"

namespace ImageTools {

void writeRawHex(const PromContent& content, RecordSink& sink) {
    constexpr std::size_t lineBytes = 32;
    std::size_t onLine = 0;
    unsigned sum = 0;
    for (const Segment& piece : content.pieces) {
        for (std::size_t i = 0; i < piece.size;) {
            const std::size_t count = std::min(piece.size - i, lineBytes - onLine);
            char* to = putData(sink.room(2 * lineBytes + 1), piece.data + i, count, sum);
            i += count;
            onLine = (onLine + count) % lineBytes;
            if (onLine == 0) {
                *to++ = '\n';
            }
            sink.advance(to);
        }
    }
    if (onLine != 0) {
        sink.write("\n", 1);
    }
}

void writeRawBinary(const PromContent& content, RecordSink& sink) {
    for (const Segment& piece : content.pieces) {
        sink.write(reinterpret_cast<const char*>(piece.data), piece.size);
    }
}

}  // namespace ImageTools
