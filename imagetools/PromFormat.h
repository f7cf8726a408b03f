// The file formats of PROM files.
#pragma once

#include <string>
#include <vector>

#include "imagetools/RecordSink.h"
#include "imagetools/SegmentMap.h"

namespace ImageTools {

/// What goes into one file: bytes at ascending addresses below 2^32, and a title for formats that have one.
struct PromContent {
    std::vector<Segment> pieces;
    std::string title;

    std::uint64_t end() const { return pieces.empty() ? 0 : pieces.back().end(); }
};

/// Writes the content; what fails shows at the sink.
using PromWriter = void (*)(const PromContent&, RecordSink&);

struct PromFormat {
    const char* name;  ///< the format's word on the command line, and the extension of its files
    PromWriter write;
    bool holdsAddresses;  ///< otherwise the bytes stand in a row, so gaps have to be filled
    unsigned rowLength;   ///< about how many characters 16 bytes take
};

/// The format of that name, which is one of the argument format's choices.
const PromFormat& promFormat(const char* name);

void writeIntelHex(const PromContent& content, RecordSink& sink);
void writeMotorolaRecords(const PromContent& content, RecordSink& sink);
void writeTektronixHex(const PromContent& content, RecordSink& sink);
void writeRawHex(const PromContent& content, RecordSink& sink);
void writeRawBinary(const PromContent& content, RecordSink& sink);

}  // namespace ImageTools
