// Bytes at addresses: an image is a map of segments, never one array, so two bytes 4 GiB apart cost two bytes.
#pragma once

#include <cstddef>
#include <cstdint>
#include <map>
#include <optional>
#include <vector>

namespace ImageTools {

/// Where the addresses of PROMs and of 32-bit callers end.
constexpr std::uint64_t addressSpace = std::uint64_t{1} << 32;

/// Bytes at an address; whoever loaded them owns them.
struct Segment {
    std::uint64_t address = 0;
    const unsigned char* data = nullptr;
    std::size_t size = 0;

    std::uint64_t end() const { return address + size; }
    /// The part from @p first up to @p last, which lie inside.
    Segment part(std::uint64_t first, std::uint64_t last) const {
        return {first, data + (first - address), static_cast<std::size_t>(last - first)};
    }
};

/// Segments in the order of their addresses, none of which is empty or overlaps another one. An address and the end of
/// a segment fit into 64 bits.
class SegmentMap {
public:
    bool isEmpty() const { return m_segments.empty(); }
    std::uint64_t lowest() const { return isEmpty() ? 0 : m_segments.begin()->second.address; }
    /// Behind the last byte.
    std::uint64_t end() const { return isEmpty() ? 0 : m_segments.rbegin()->second.end(); }
    std::uint64_t span() const { return end() - lowest(); }

    /// The lowest segment that shares an address with the range; null where none does. Logarithmic.
    const Segment* overlap(std::uint64_t address, std::uint64_t size) const;

    /// Adds a segment that overlaps none; an empty one is nothing.
    void add(const Segment& segment);

    /// Adds what is new of a segment. An address at which another byte stands already is the result, and nothing is
    /// added then.
    std::optional<std::uint64_t> addAgreeing(const Segment& segment);

    /// The segments between two addresses, cut there.
    std::vector<Segment> slice(std::uint64_t first, std::uint64_t last) const;
    std::vector<Segment> all() const { return slice(lowest(), end()); }

private:
    using Map = std::map<std::uint64_t, Segment>;

    /// The first segment that ends behind the address.
    Map::const_iterator firstBehind(std::uint64_t address) const;

    Map m_segments;
};

}  // namespace ImageTools
