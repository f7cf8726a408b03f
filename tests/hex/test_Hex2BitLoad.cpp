// Text into vectors and byte arrays; more worked loads stand in the guide.
#include "hex/Hex2BitTest.h"

namespace {

TEST_P(Hex2BitTest, LoadsOfTextsThatFitInNoOrderlyWay) {
    struct Case {
        const char* text;
        int size;
        std::size_t length;
        bool descending;
        bool byteSwap;
        const char* indexes;  ///< x: not reached
    };
    const Case cases[] = {
        {"123", 10, 12, true, false, "1100010010xx"},
        {"1", 4, 4, false, true, "1000"},
        {"123", 12, 12, false, true, "010010001100"},
        {"aBcDeF", 24, 24, false, false, "101010111100110111101111"},
        {"a g5", 16, 16, false, false, "10100101xxxxxxxx"},
        {" 12", 12, 12, false, true, "10000100xxxx"},  // the pairs are " 1" and "2"
        {"1\xB2\xE1", 12, 12, false, false, "0001xxxxxxxx"},
        {"", 8, 8, false, false, "xxxxxxxx"},
        {"12", 0, 8, false, false, "xxxxxxxx"},
        {"12", -5, 8, true, false, "xxxxxxxx"},
    };
    for (const Case& one : cases) {
        for (const char before : {'0', '1'}) {
            RLBitVec vector(one.length, before == '1');
            Hex2Bit::convertHexString2BitVec(&vector, one.text, one.size, one.descending, one.byteSwap, false);
            std::string expected = one.indexes;
            std::replace(expected.begin(), expected.end(), 'x', before);
            EXPECT_EQ(bitsOf(vector), expected) << one.text << ", size " << one.size;
        }
    }
}

TEST_P(Hex2BitTest, NewVectors) {
    const std::pair<std::unique_ptr<RLBitVec>, const char*> cases[] = {
        {Hex2Bit::convertHexString2BitVec("1", 16, false, false, true), "0000000000000001"},
        {Hex2Bit::convertHexString2BitVec("1", 16, false, false, false), "0001000000000000"},
        {Hex2Bit::convertHexString2BitVec("123", 14, false, false, true), "00010010001100"},
        {Hex2Bit::convertBinString2BitVec("101", 6, false), "101000"},
        {Hex2Bit::convertBinString2BitVec("101", 6, true), "000101"},
        {Hex2Bit::convertBinString2BitVec("0x1y0", 4, false), "0111"},
        {Hex2Bit::convertString2BitVec("\x0A\0\x7F", 3, false, false), "1010000001111111"},
        {Hex2Bit::convertString2BitVec("\x81", 1, false, false), "11111111111111111111111110000001"},
        {Hex2Bit::convertString2BitVec("AB", -1, false, false), ""},
        {Hex2Bit::convertHexString2BitVec(nullptr, -8, false, false, true), ""}};
    for (const auto& [vector, bits] : cases) {
        EXPECT_EQ(bitsOf(*vector), bits);
    }
    EXPECT_NE(Hex2Bit::convertBinString2BinData(nullptr, -8, false), nullptr);
}

TEST_P(Hex2BitTest, FillValueAndInitialise) {
    Hex2Bit::setInitValue(true);
    HexModel::NumberedVec vector(12, Numbering::Mirrored);
    Hex2Bit::convertHexString2BitVec(&vector, "0", 4, false, false, true);
    EXPECT_EQ(bitsOf(vector), "000011111111");
    EXPECT_EQ(vector.data()[1], 0xF0) << "the usual numbering is back, and the slack is filled";
    EXPECT_EQ(bitsOf(*Hex2Bit::convertHexString2BitVec("0", 12, true, false, false)), "111111110000");
    const auto bytes = Hex2Bit::convertBinString2BinData("000", 12, false);
    EXPECT_EQ(bytes[0] & bytes[2], 0xFF) << "an array of (12 + 14) / 8 bytes";
}

TEST_P(Hex2BitTest, PlainTextIntoHeldVectors) {
    RLBitVec vector(20);
    Hex2Bit::convertString2BitVec(&vector, "AB", 2, true, false);
    EXPECT_EQ(bitsOf(vector), "01000010100000100000") << "loaded like any text of 16 bits";
    RLBitVec small(8);
    Hex2Bit::convertString2BitVec(&small, "AB", 2, false, false);
    EXPECT_EQ(bitsOf(small), "01000010") << "the left end is lost";
    Hex2Bit::convertBpiHexString2BitVec(&small, "7e", 8, false);
    EXPECT_EQ(bitsOf(small), "01111110");
}

TEST_P(Hex2BitTest, NullTextsAndVectorsLeaveEverythingAlone) {
    RLBitVec vector(8, true);
    Hex2Bit::convertHexString2BitVec(&vector, nullptr, 8, false, false, false);
    Hex2Bit::convertBinString2BitVec(&vector, nullptr, 8, false);
    Hex2Bit::convertString2BitVec(&vector, nullptr, 8, false, false);
    EXPECT_EQ(bitsOf(vector), "11111111");
    Hex2Bit::convertHexString2BitVec(nullptr, "12", 8, false, false, true);
    Hex2Bit::convertBinString2BitVec(nullptr, "1", 8, false);
    Hex2Bit::convertString2BitVec(nullptr, "AB", 2, false, false);
}

#ifdef NDEBUG
TEST_P(Hex2BitTest, IndexesBeyondTheVectorArePassedOver) {
    RLBitVec vector(6);
    Hex2Bit::convertHexString2BitVec(&vector, "fe", 8, false, false, false);
    EXPECT_EQ(bitsOf(vector), "111111");
    Hex2Bit::convertHexString2BitVec(&vector, "fe", 8, true, false, false);
    EXPECT_EQ(bitsOf(vector), "011111") << "the last bit of the text at index 0";
    Hex2Bit::convertHexString2BitVec(&vector, "a000", 0x7FFFFFFF, true, false, false);
    EXPECT_EQ(bitsOf(vector), "011111") << "all of it beyond";
    RLBitVec other(6);
    Hex2Bit::convertBinString2BitVec(&other, "11000001", 8, true);
    EXPECT_EQ(bitsOf(other), "100000");
}
#endif

/// Random loads against the model: all orders, fill values and numberings, foreign characters, cuts, spare length.
class Hex2BitLoads : public Hex2BitTest {
protected:
    std::string text(std::size_t length, std::string_view alphabet, std::size_t foreignPercent) {
        std::string result(length, ' ');
        for (char& character : result) {
            const bool isForeign = below(100) < foreignPercent;
            character = isForeign ? static_cast<char>(1 + below(255)) : alphabet[below(alphabet.size())];
        }
        return result;
    }

    void compareOnce(std::size_t size, std::size_t textLength) {
        const Numbering numbering = HexModel::numberings[coin() ? 0 : below(3)];
        HexModel::NumberedVec vector(size + (coin() ? below(70) : 0), numbering, coin());
        Model model = HexModel::modelOf(vector, numbering);
        const bool descending = coin();
        const bool byteSwap = coin();
        const auto places = static_cast<int>(size);
        const bool isHex = coin();
        const std::string characters =
            isHex ? text(textLength, "0123456789abcdefABCDEF", coin() ? 10 : 0) : text(textLength, "01", 5);
        if (isHex) {
            Hex2Bit::convertHexString2BitVec(&vector, characters.c_str(), places, descending, byteSwap, false);
            HexModel::loadHex(model, characters, places, descending, byteSwap);
        } else {
            Hex2Bit::convertBinString2BitVec(&vector, characters.c_str(), places, descending);
            HexModel::loadBinary(model, characters, places, descending);
        }
        ASSERT_EQ(HexModel::arrayOf(vector), model.bytes) << characters << ", size " << size << descending << byteSwap;
    }
};

TEST_P(Hex2BitLoads, AgreeWithTheModel) {
    for (std::size_t round = 0; round < 151 * 60 && !HasFatalFailure(); ++round) {
        round % 151 == 0 ? compareOnce(below(30000), below(9000)) : compareOnce(round % 151, below(140));
    }
}

const auto widthName = [](const auto& width) { return width.param ? "Wide" : "Narrow"; };
INSTANTIATE_TEST_SUITE_P(Width, Hex2BitTest, testing::Bool(), widthName);
INSTANTIATE_TEST_SUITE_P(Width, Hex2BitLoads, testing::Bool(), widthName);

}  // namespace
