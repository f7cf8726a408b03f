// Byte buffers, numbers and the conversions back to text; more worked texts stand in the guide.
#include "MessageRecorder.h"
#include "hex/Hex2BitTest.h"

namespace {

std::unique_ptr<RLBitVec> vectorOf(const char* hex) {
    return Hex2Bit::convertHexString2BitVec(hex, static_cast<int>(4 * std::string(hex).size()), false, false, false);
}

TEST_P(Hex2BitTest, ByteBuffers) {
    for (int count = 0; count <= 140; ++count) {
        Bytes bytes = randomBytes(static_cast<std::size_t>(count));
        Bytes expected = bytes;
        std::transform(bytes.begin(), bytes.end(), expected.begin(), HexModel::mirrored);
        const std::unique_ptr<unsigned char[]> copy(Hex2Bit::reverseBufferBits(bytes.data(), count));
        EXPECT_EQ(Bytes(copy.get(), copy.get() + count), expected);
        Hex2Bit::reverseReadBufferBits(bytes.data(), count);
        EXPECT_EQ(bytes, expected);
    }
    EXPECT_EQ(Hex2Bit::swapBits(0x12), 0x48);
    Bytes five{1, 2, 3, 4, 5};
    EXPECT_EQ(Hex2Bit::swapBytes(five.data(), 5), five.data());
    EXPECT_EQ(five, (Bytes{2, 1, 4, 3, 5}));

    const std::unique_ptr<unsigned char[]> none(Hex2Bit::reverseBufferBits(five.data(), -1));
    EXPECT_NE(none, nullptr);
    Hex2Bit::reverseReadBufferBits(nullptr, 3);
    EXPECT_EQ(Hex2Bit::swapBytes(nullptr, 4), nullptr);
}

TEST_P(Hex2BitTest, TextsOfWhatIsMissingOrEmpty) {
    const unsigned char bytes[] = {0xA1, 0x0F};
    EXPECT_EQ(taken(Hex2Bit::convertBinData2BinString(nullptr, 12, true)), "");
    EXPECT_EQ(taken(Hex2Bit::convertBinData2HexString(bytes, -1, true, true)), "");
    EXPECT_EQ(taken(Hex2Bit::convertBinString2HexString("1x01", 9, false)), "900") << "what is missing counts as 0";
    EXPECT_EQ(taken(Hex2Bit::convertBinString2HexString("1010", 4, true)), "05");
    EXPECT_EQ(taken(Hex2Bit::convertBinString2HexString("1010", 0, true)), "");
    EXPECT_EQ(taken(Hex2Bit::convertBinString2HexString(nullptr, 8, true)), "00");
    EXPECT_EQ(taken(Hex2Bit::convertBinString2HexString("11110000", false)), "f0");
}

TEST_P(Hex2BitTest, BytesToTextAgreesWithTheModel) {
    for (int round = 0; round <= 154; ++round) {
        const int bits = round <= 150 ? round : std::array{4095, 4096, 8191, 20001}[static_cast<unsigned>(round) - 151];
        const Bytes bytes = randomBytes(static_cast<std::size_t>(bits + 7) / 8);
        for (const bool positionOrder : {false, true}) {
            const std::string binary = HexModel::binaryText(bytes.data(), bits, positionOrder);
            ASSERT_EQ(taken(Hex2Bit::convertBinData2BinString(bytes.data(), bits, positionOrder)), binary);
            std::string foreign = binary;  // only the character 1 counts as one
            for (char& character : foreign) {
                const std::size_t drawn = 1 + below(255);
                character = static_cast<char>(character == '1' ? '1' : drawn == '1' ? '0' : drawn);
            }
            for (const bool byteMode : {false, true}) {
                const std::string hex = HexModel::hexText(binary, byteMode);
                ASSERT_EQ(taken(Hex2Bit::convertBinData2HexString(bytes.data(), bits, positionOrder, byteMode)), hex);
                ASSERT_EQ(taken(Hex2Bit::convertBinString2HexString(foreign.c_str(), bits, byteMode)), hex);
            }
        }
        const RLBitVec vector(bytes.data(), static_cast<std::size_t>(bits));
        ASSERT_EQ(Hex2Bit::convertBin2Int(bytes.data(), bits), HexModel::number(HexModel::modelOf(vector)));
    }
}

TEST_P(Hex2BitTest, HexTextToNumbers) {
    struct Case {
        const char* text;
        int digits;
        int number;
        int filled;  ///< with ones as the fill value
    };
    const Case cases[] = {
        {"1234", 2, 0x34, 0x34},
        {"12", 4, 0x1200, 0x12FF},
        {"aBcD", 4, 0xABCD, 0xABCD},
        {"ffffffff", 8, 0x7FFFFFFF, 0x7FFFFFFF},
        {"80000001", 8, 1, 1},
        {"123456789a", 10, 0x3456789A, 0x3456789A},
        {"1", 20, 0, 0x7FFFFFFF},
        {"1 2", 3, 0x120, 0x12F},
        {"1 2", 2, 0x20, 0x2F},  // three characters counted: the digit 1 is cut
        {"", 2, 0, 0xFF},
        {"12", 0, 0, 0},
        {"12", -3, 0, 0},
        {nullptr, 2, 0, 0xFF},
    };
    for (const Case& one : cases) {
        for (const bool fill : {false, true}) {
            Hex2Bit::setInitValue(fill);
            EXPECT_EQ(Hex2Bit::convertHexString2Int(one.text, one.digits), fill ? one.filled : one.number);
            EXPECT_EQ(Hex2Bit::convertHexString2Long(one.text, one.digits), fill ? one.filled : one.number);
            const auto vector = Hex2Bit::convertHexString2BitVec(one.text, 4 * one.digits, false, false, false);
            EXPECT_EQ(HexModel::number(HexModel::modelOf(*vector)), fill ? one.filled : one.number) << "by a vector";
        }
    }
    const unsigned char bytes[] = {0x12, 0x34, 0xFF, 0xFF};
    EXPECT_EQ(Hex2Bit::convertBin2Long(bytes, 32), 0x7FFF3412);
    EXPECT_EQ(Hex2Bit::convertBin2Int(bytes, -1), 0);
    EXPECT_EQ(Hex2Bit::convertBin2Int(nullptr, 8), 0);
}

TEST_P(Hex2BitTest, NumbersIntoHeldVectorsAgreeWithTheModel) {
    for (const Numbering numbering : HexModel::numberings) {
        for (const std::size_t length : {0U, 1U, 4U, 8U, 31U, 32U, 33U, 70U}) {
            for (const std::uint32_t value : {0U, 1U, 0xBU, 0xFFU, 0x12345678U, 0x7FFFFFFFU, 0x80000000U, ~0U}) {
                for (int form = 0; form < 8; ++form) {
                    const bool fromIndexZero = form % 2 != 0;
                    const bool isSigned = form / 2 % 2 != 0;
                    Hex2Bit::setInitValue(form / 4 != 0);
                    HexModel::NumberedVec vector(length, numbering, !Hex2Bit::m_initValue);
                    isSigned ? Hex2Bit::convertInt2BitVec(static_cast<int>(value), 9, &vector, fromIndexZero)
                             : Hex2Bit::convertInt2BitVec(value, 9, &vector, fromIndexZero);
                    const HexModel::NumberedVec filled(length, numbering, Hex2Bit::m_initValue);
                    Model model = HexModel::modelOf(filled, numbering);
                    const bool isIgnored = isSigned && value > 0x7FFFFFFF;
                    HexModel::writeNumber(model, isIgnored ? 0 : value, fromIndexZero);
                    ASSERT_EQ(HexModel::arrayOf(vector), model.bytes) << value << " in " << length << ", form " << form;
                }
            }
        }
    }
    Hex2Bit::convertInt2BitVec(5, 0, nullptr);
    Hex2Bit::convertInt2BitVec(5U, 0, nullptr);
}

TEST_P(Hex2BitTest, NumbersIntoNewVectors) {
    EXPECT_EQ(Hex2Bit::convertInt2BitVec(0xB, 8)->data()[0], 0x0B);
    EXPECT_EQ(Hex2Bit::convertLong2BitVec(0x1FF, 4)->data()[0], 0x0F);
    EXPECT_EQ(Hex2Bit::convertInt2BitVec(-1, 8)->data()[0], 0x00);
    EXPECT_EQ(Hex2Bit::convertInt2BitVec(5, -1)->length(), 0U);
    Hex2Bit::setInitValue(true);
    EXPECT_EQ(Hex2Bit::convertInt2BitVec(0xB, 8)->data()[0], 0xFF);
}

TEST_P(Hex2BitTest, WidthsOnBothSidesOfEachStep) {
    // Worked out for every value there is: the widths, multiples of 4, grow by 4 behind these values and nowhere else.
    std::size_t width = 0;
    for (const int last : {0, 14, 254, 4094, 65534, 1048574, 16777199, 268435208}) {
        EXPECT_EQ(Hex2Bit::convertInt2BitVec(last)->length(), width) << last;
        width += 4;
        EXPECT_EQ(Hex2Bit::convertInt2BitVec(last + 1)->length(), width) << last + 1;
    }
    EXPECT_EQ(Hex2Bit::convertInt2BitVec(0x7FFFFFFF)->length(), width);
}

TEST_P(Hex2BitTest, NumbersToText) {
    const std::pair<int, const char*> texts[] = {
        {0, "00000000"}, {1, "1"},     {14, "e"},        {15, "0f"},
        {255, "0ff"},    {256, "100"}, {-1, "00000000"}, {0x7FFFFFFF, "7fffffff"}};
    const char* const first = Hex2Bit::convertInt2HexString(255);
    for (const auto& [value, text] : texts) {
        EXPECT_STREQ(Hex2Bit::convertInt2HexString(value), text);
    }
    EXPECT_EQ(Hex2Bit::convertInt2HexString(255), first) << "a text is kept once";

    EXPECT_EQ(taken(Hex2Bit::swapWord(0x12345678)), "56781234");
    EXPECT_EQ(taken(Hex2Bit::swapWord(-2)), "00000000");
    Hex2Bit::setInitValue(true);
    EXPECT_EQ(taken(Hex2Bit::swapWord(1)), "ffffffff");
    EXPECT_STREQ(Hex2Bit::convertInt2HexString(1), "f");
}

TEST_P(Hex2BitTest, VectorsToCharacters) {
    struct Case {
        const char* hex;
        bool stop;
        const char* text;
        bool result;
    };
    const Case cases[] = {
        {"4142", true, "AB", true},    {"41f2", true, "A", false},   {"414", true, "A", true},
        {"41f243", false, "AC", true}, {"410043", true, "AC", true}, {"", true, "", true},
    };
    for (const Case& one : cases) {
        const MessageRecorder messages;
        char out[8] = "before";
        EXPECT_EQ(Hex2Bit::convertBitVec2String(vectorOf(one.hex).get(), out, one.stop), one.result);
        EXPECT_STREQ(out, one.text);
        const std::vector<std::string> expected(one.result ? 0 : 1, " The binary data cannot be displayed");
        EXPECT_EQ(messages.status(), expected);
    }
    char out[8] = "before";
    EXPECT_TRUE(Hex2Bit::convertBitVec2String(nullptr, out));
    EXPECT_STREQ(out, "");
    EXPECT_FALSE(Hex2Bit::convertBitVec2String(vectorOf("41").get(), nullptr));
}

TEST_P(Hex2BitTest, HexDigitsAtAnAddress) {
    const unsigned char bytes[] = {0xA1, 0x0F, 0x33, 0xCC};
    const RLBitVec vector(bytes, 32);
    EXPECT_EQ(taken(Hex2Bit::getHexStringByHexAddress(&vector, 1, 2, 8)), "0f");
    EXPECT_EQ(taken(Hex2Bit::getHexStringByHexAddress(&vector, 3, 6, 8)), "cc0000") << "nothing behind the end";
    EXPECT_EQ(taken(Hex2Bit::getHexStringByHexAddress(&vector, 0, -2, 8)), "");
    for (const int address : {4, 5, -1, 0x7FFFFFFF}) {
        EXPECT_EQ(Hex2Bit::getHexStringByHexAddress(&vector, address, 2, 8), nullptr) << address;
    }
    EXPECT_EQ(Hex2Bit::getHexStringByHexAddress(nullptr, 0, 2, 8), nullptr);
}

TEST_P(Hex2BitTest, VectorsToTextAgreeWithTheModel) {
    const MessageRecorder silent;
    for (std::size_t round = 0; round < 450; ++round) {
        const Numbering numbering = HexModel::numberings[round % 3];
        HexModel::NumberedVec vector(1 + round / 3, numbering);
        for (std::size_t i = 0; i < vector.length(); ++i) {
            below(4) == 0 ? vector.setBit(i) : void();
        }
        const Model model = HexModel::modelOf(vector, numbering);
        const std::size_t address = below(vector.length());
        const auto digits = static_cast<int>(2 * below(20));
        ASSERT_EQ(taken(Hex2Bit::getHexStringByHexAddress(&vector, static_cast<int>(address), digits, 1)),
                  HexModel::hexAt(model, address, digits));
        const bool stop = coin();
        std::string expected;
        std::vector<char> out(vector.length() / 8 + 1);
        const bool result = HexModel::characters(model, stop, expected);
        ASSERT_EQ(Hex2Bit::convertBitVec2String(&vector, out.data(), stop), result);
        ASSERT_EQ(out.data(), expected);
    }
}

}  // namespace
