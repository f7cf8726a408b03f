// Any text as memory text, in each of its readings: the segments lie in the bytes that were read.

#include <cstdint>
#include <cstdlib>
#include <string_view>
#include <vector>

#include "imagetools/MemReader.h"

extern "C" int LLVMFuzzerTestOneInput(const std::uint8_t* data, std::size_t size) {
    if (size == 0) {
        return 0;
    }
    const ImageTools::MemOptions options{(data[0] & 1U) != 0, (data[0] & 2U) != 0, (data[0] & 4U) != 0};
    const std::string_view text(reinterpret_cast<const char*>(data) + 1, size - 1);
    std::vector<unsigned char> bytes(text.size() / 2 + 1);
    ImageTools::SegmentMap segments;
    if (!ImageTools::readMem(text, options, bytes.data(), segments).empty()) {
        return 0;
    }
    std::uint64_t end = 0;
    for (const ImageTools::Segment& segment : segments.all()) {
        const bool isInside =
            segment.data >= bytes.data() && segment.data + segment.size <= bytes.data() + text.size() / 2;
        if (!isInside || segment.address < end || segment.end() > ImageTools::addressSpace) {
            std::abort();
        }
        end = segment.end();
    }
    return 0;
}
