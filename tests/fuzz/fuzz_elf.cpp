// Any bytes as an object file: what is read lies inside the file and inside the address space.
#include "fuzz/Segments.h"
#include "imagetools/ElfReader.h"

void fuzz(Input input) {
    const auto* const data = reinterpret_cast<const unsigned char*>(input.bytes().data());
    ImageTools::SegmentMap segments;
    std::string note;
    if (ImageTools::readElf(ImageTools::ByteSource(data, input.bytes().size()), segments, note).empty()) {
        requireInside(segments, data, input.bytes().size());
    }
}
