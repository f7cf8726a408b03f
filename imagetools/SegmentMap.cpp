#include "imagetools/SegmentMap.h"

#include <algorithm>

namespace ImageTools {

SegmentMap::Map::const_iterator SegmentMap::firstBehind(std::uint64_t address) const {
    auto found = m_segments.upper_bound(address);
    if (found != m_segments.begin()) {
        const auto before = std::prev(found);
        if (before->second.end() > address) {
            found = before;
        }
    }
    return found;
}

const Segment* SegmentMap::overlap(std::uint64_t address, std::uint64_t size) const {
    const auto found = firstBehind(address);
    const bool shares = size != 0 && found != m_segments.end() && found->first < address + size;
    return shares ? &found->second : nullptr;
}

void SegmentMap::add(const Segment& segment) {
    if (segment.size != 0) {
        m_segments.emplace(segment.address, segment);
    }
}

std::optional<std::uint64_t> SegmentMap::addAgreeing(const Segment& segment) {
    std::vector<Segment> fresh;
    std::uint64_t next = segment.address;
    for (const Segment& present : slice(segment.address, segment.end())) {
        const Segment same = segment.part(present.address, present.end());
        const auto differing = std::mismatch(same.data, same.data + same.size, present.data).first;
        if (differing != same.data + same.size) {
            return same.address + static_cast<std::uint64_t>(differing - same.data);
        }
        fresh.push_back(segment.part(next, present.address));
        next = present.end();
    }
    fresh.push_back(segment.part(next, segment.end()));
    for (const Segment& part : fresh) {
        add(part);
    }
    return std::nullopt;
}

std::vector<Segment> SegmentMap::slice(std::uint64_t first, std::uint64_t last) const {
    std::vector<Segment> result;
    for (auto i = firstBehind(first); i != m_segments.end() && i->first < last; ++i) {
        const Segment& segment = i->second;
        result.push_back(segment.part(std::max(segment.address, first), std::min(segment.end(), last)));
    }
    return result;
}

}  // namespace ImageTools
