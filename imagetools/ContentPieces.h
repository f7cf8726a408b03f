// Gaps of an image: filled for formats that need it, or made where the data is what an erased PROM holds.
#pragma once

#include <array>
#include <vector>

#include "imagetools/SegmentMap.h"
#include "imagetools/Texts.h"

namespace ImageTools {

/// Bytes of one value, to point at from as many segments as need them.
class FillBlock {
public:
    explicit FillBlock(unsigned char fill) { m_bytes.fill(fill); }

    unsigned char value() const { return m_bytes[0]; }
    /// Appends segments of the fill from @p first up to @p last.
    void append(std::vector<Segment>& pieces, std::uint64_t first, std::uint64_t last) const;

private:
    std::array<unsigned char, std::size_t{64} << 10> m_bytes;
};

/// Puts the fill between the pieces. A gap of more than 256 MiB is a problem.
Problem fillGaps(std::vector<Segment>& pieces, const FillBlock& fill);

/// Takes out the rows of a record that hold nothing but the fill.
void dropFill(std::vector<Segment>& pieces, unsigned char fill);

}  // namespace ImageTools
