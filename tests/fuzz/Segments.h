// What holds of the segments that any reader of images finds.
#pragma once

#include "fuzz/Fuzz.h"
#include "imagetools/SegmentMap.h"

/// They lie in the first @p size bytes of what was read, and rise inside the address space without overlap.
inline void requireInside(const ImageTools::SegmentMap& segments, const unsigned char* bytes, std::size_t size) {
    std::uint64_t end = 0;
    for (const ImageTools::Segment& segment : segments.all()) {
        require(segment.data >= bytes && segment.data + segment.size <= bytes + size);
        require(segment.address >= end && segment.end() <= ImageTools::addressSpace);
        end = segment.end();
    }
}
