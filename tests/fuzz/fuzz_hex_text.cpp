// Any bytes to text and numbers, and any text to numbers, against the model.
#include "fuzz/Fuzz.h"
#include "hex/HexChecks.h"

void fuzz(Input input) {
    const unsigned flags = input.byte();
    const unsigned address = input.byte();
    const auto digits = static_cast<int>(input.byte() / 2 * 2);
    const auto count = static_cast<int>(input.byte());
    const auto* const bytes = reinterpret_cast<const unsigned char*>(input.bytes().data());
    const std::size_t length = 8 * input.bytes().size() - (input.isEmpty() ? 0 : flags % 8);
    const Numbering numbering = HexModel::numberings[(flags >> 3) % 3];

    require(HexChecks::bytesAgree(bytes, static_cast<int>(length)));
    HexModel::NumberedVec vector(length, numbering);
    for (std::size_t i = 0; i < length; ++i) {
        if ((bytes[i / 8] >> i % 8 & 1) != 0) {
            vector.setBit(i);
        }
    }
    require(HexChecks::vectorAgrees(vector, numbering, address, digits, flags >= 128));
    require(HexChecks::textAgrees(input.text(), count));
}
