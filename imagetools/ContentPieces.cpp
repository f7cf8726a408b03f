#include "imagetools/ContentPieces.h"

#include <utility>

#include "imagetools/Records.h"

namespace ImageTools {
namespace {

constexpr std::uint64_t largestGap = std::uint64_t{256} << 20;

}  // namespace

void FillBlock::append(std::vector<Segment>& pieces, std::uint64_t first, std::uint64_t last) const {
    while (first < last) {
        const auto size = static_cast<std::size_t>(std::min<std::uint64_t>(last - first, m_bytes.size()));
        pieces.push_back({first, m_bytes.data(), size});
        first += size;
    }
}

Problem fillGaps(std::vector<Segment>& pieces, const FillBlock& fill) {
    std::vector<Segment> filled;
    for (const Segment& piece : pieces) {
        const std::uint64_t next = filled.empty() ? piece.address : filled.back().end();
        if (piece.address - next > largestGap) {
            return "the gap between the data up to " + hexText(next - 1) + " and that from " + hexText(piece.address) +
                   " is too large to be filled, " + countText(piece.address - next, "byte") + " where at most " +
                   std::to_string(largestGap) + " are";
        }
        fill.append(filled, next, piece.address);
        filled.push_back(piece);
    }
    pieces = std::move(filled);
    return {};
}

void dropFill(std::vector<Segment>& pieces, unsigned char fill) {
    std::vector<Segment> kept;
    forEachRow(pieces, [&kept, fill](const Segment& row) {
        const auto* const end = row.data + row.size;
        if (std::all_of(row.data, end, [fill](unsigned char byte) { return byte == fill; })) {
            return;
        }
        const bool goesOn =
            !kept.empty() && kept.back().end() == row.address && kept.back().data + kept.back().size == row.data;
        if (goesOn) {
            kept.back().size += row.size;
        } else {
            kept.push_back(row);
        }
    });
    pieces = std::move(kept);
}

}  // namespace ImageTools
