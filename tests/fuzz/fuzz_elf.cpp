// Any bytes as an object file: what is read lies inside the file and inside the address space.

#include <cstdint>
#include <cstdlib>
#include <string>

#include "imagetools/ElfReader.h"

extern "C" int LLVMFuzzerTestOneInput(const std::uint8_t* data, std::size_t size) {
    ImageTools::SegmentMap segments;
    std::string note;
    if (!ImageTools::readElf(ImageTools::ByteSource(data, size), segments, note).empty()) {
        return 0;
    }
    std::uint64_t end = 0;
    for (const ImageTools::Segment& segment : segments.all()) {
        const bool isInside = segment.data >= data && segment.data + segment.size <= data + size;
        if (!isInside || segment.address < end || segment.end() > ImageTools::addressSpace) {
            std::abort();
        }
        end = segment.end();
    }
    return 0;
}
