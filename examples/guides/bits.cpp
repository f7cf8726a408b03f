// Bits of docs/guides.md: from text to bits and back.

#include <TessalUtility.h>

#include <cstdio>
#include <memory>

int main() {
    // The number 0x12A5 in 16 bits. Index 0 of an RLBitVec is the left end of the number as it is read.
    std::unique_ptr<RLBitVec> word = Hex2Bit::convertHexString2BitVec("12a5", 16, false, false, true);
    std::printf("%s, data() is %02X %02X\n", toGroupedText(*word).c_str(), word->data()[0], word->data()[1]);

    // A field of it: the four bits from index 8 on.
    RLBitVec field(4);
    for (std::size_t i = 0; i < field.length(); ++i) {
        if (word->testBit(8 + i)) {
            field.setBit(i);
        }
    }
    std::printf("field %s has %zu ones\n", toGroupedText(field).c_str(), field.count());

    // Whole vectors are combined word by word.
    RLBitVec mask(16, true);
    mask.clearBit(15);
    RLBitVec masked(*word);
    masked &= mask;
    std::printf("%s", difference(*word, masked).c_str());

    const std::unique_ptr<char[]> text(Hex2Bit::convertBinData2HexString(masked.data(), 16, false, false));
    std::printf("as text %s\n", text.get());
}
