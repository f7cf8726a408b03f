// Tektronix extended hexadecimal: records of their length in characters, a type, the sum of their characters' values,
// an address with its number of digits before it, and data.
#include "imagetools/PromFormat.h"
#include "imagetools/Records.h"

namespace ImageTools {
namespace {

enum RecordType : unsigned { data = 6, end = 8 };

constexpr std::size_t longestRecord = 1 + 5 + 9 + 2 * rowSize + 1;

/// A hex digit's value in the sum is the number it stands for.
constexpr unsigned sumOfDigits(unsigned byte) {
    return (byte >> 4) + (byte & 0xFU);
}

unsigned digitsOf(std::uint64_t address) {
    unsigned digits = 1;
    while (address >> (4 * digits) != 0) {
        ++digits;
    }
    return digits;
}

char* putAddress(char* to, std::uint64_t address, unsigned& sum) {
    unsigned digits = digitsOf(address);
    *to++ = ByteTables::upperHexDigits[digits];
    sum += digits;
    while (digits-- > 0) {
        const unsigned digit = address >> (4 * digits) & 0xFU;
        *to++ = ByteTables::upperHexDigits[digit];
        sum += digit;
    }
    return to;
}

void putRecord(RecordSink& sink, RecordType type, const Segment& row) {
    constexpr std::size_t headSize = 6;  // "%", length, type, sum
    char* const record = sink.room(longestRecord);
    unsigned sum = type;
    char* to = putAddress(record + headSize, row.address, sum);
    for (std::size_t i = 0; i < row.size; ++i) {
        sum += sumOfDigits(row.data[i]);
        to = putByte(to, row.data[i]);
    }
    const auto length = static_cast<unsigned>(to - record - 1);
    sum += sumOfDigits(length);
    record[0] = '%';
    putByte(record + 1, length);
    record[3] = ByteTables::upperHexDigits[type];
    putByte(record + 4, sum);
    *to++ = '\n';
    sink.advance(to);
}

}  // namespace

void writeTektronixHex(const PromContent& content, RecordSink& sink) {
    forEachRow(content.pieces, [&](const Segment& row) { putRecord(sink, data, row); });
    putRecord(sink, end, {});
}

}  // namespace ImageTools
