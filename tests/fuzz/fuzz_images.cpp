// Any bytes as an object file, and as memory text in each of its readings.
#include <vector>

#include "fuzz/Fuzz.h"
#include "imagetools/ElfReader.h"
#include "imagetools/MemReader.h"

namespace {

/// The segments lie in the first @p size bytes of what was read, and rise inside the address space without overlap.
void requireInside(const ImageTools::SegmentMap& segments, const unsigned char* bytes, std::size_t size) {
    std::uint64_t end = 0;
    for (const ImageTools::Segment& segment : segments.all()) {
        require(segment.data >= bytes && segment.data + segment.size <= bytes + size);
        require(segment.address >= end && segment.end() <= ImageTools::addressSpace);
        end = segment.end();
    }
}

}  // namespace

void fuzz(Input input) {
    const auto* const file = reinterpret_cast<const unsigned char*>(input.bytes().data());
    const std::size_t size = input.bytes().size();
    ImageTools::SegmentMap ofFile;
    std::string note;
    if (ImageTools::readElf(ImageTools::ByteSource(file, size), ofFile, note).empty()) {
        requireInside(ofFile, file, size);
    }
    const unsigned flags = input.byte();
    const ImageTools::MemOptions options{(flags & 1U) != 0, (flags & 2U) != 0, (flags & 4U) != 0};
    std::vector<unsigned char> bytes(input.bytes().size() / 2 + 1);
    ImageTools::SegmentMap ofText;
    if (ImageTools::readMem(input.bytes(), options, bytes.data(), ofText).empty()) {
        requireInside(ofText, bytes.data(), input.bytes().size() / 2);
    }
}
