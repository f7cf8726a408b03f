// Any text as memory text, in each of its readings: the segments lie in the bytes that were read.
#include <vector>

#include "fuzz/Segments.h"
#include "imagetools/MemReader.h"

void fuzz(Input input) {
    const unsigned flags = input.byte();
    const ImageTools::MemOptions options{(flags & 1U) != 0, (flags & 2U) != 0, (flags & 4U) != 0};
    std::vector<unsigned char> bytes(input.bytes().size() / 2 + 1);
    ImageTools::SegmentMap segments;
    if (ImageTools::readMem(input.bytes(), options, bytes.data(), segments).empty()) {
        requireInside(segments, bytes.data(), input.bytes().size() / 2);
    }
}
