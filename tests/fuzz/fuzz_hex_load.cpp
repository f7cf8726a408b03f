// Any text loaded as hex, binary and plain text, in any order and numbering, against the model.
#include "fuzz/Fuzz.h"
#include "hex/HexChecks.h"

void fuzz(Input input) {
    const unsigned flags = input.byte();
    const unsigned lowPlaces = input.byte();
    const auto places = static_cast<int>(lowPlaces | (input.byte() & 0x1F) << 8);
    const std::size_t length = static_cast<std::size_t>(places) + input.byte() % 32;
    const Numbering numbering = HexModel::numberings[(flags >> 3) % 3];
    require(HexChecks::loadAgrees(
        {input.bytes(), length, places, numbering, (flags & 4U) != 0, (flags & 1U) != 0, (flags & 2U) != 0}));
}
