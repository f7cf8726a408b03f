// Text into vectors and byte arrays.
#include <gtest/gtest.h>

#include <random>
#include <string>

#include "Hex2Bit.h"
#include "hex/HexModel.h"

namespace {

using HexModel::Numbering;

/// The bits by index, 0 first.
std::string bitsOf(const RLBitVec& vector) {
    std::string bits;
    for (std::size_t i = 0; i < vector.length(); ++i) {
        bits.push_back(vector.testBit(i) ? '1' : '0');
    }
    return bits;
}

class Hex2BitLoad : public testing::Test {
protected:
    ~Hex2BitLoad() override { Hex2Bit::setInitValue(false); }
};

TEST_F(Hex2BitLoad, HexTextFillsIndexesAsTheTableSays) {
    struct Case {
        const char* text;
        int size;
        std::size_t length;
        bool descending;
        bool byteSwap;
        const char* indexes;  ///< of a vector whose bits are all 1 before; x: not reached
    };
    const Case cases[] = {
        {"123", 12, 12, false, false, "000100100011"},
        {"123", 12, 12, true, false, "110001001000"},
        {"123", 10, 12, false, false, "0100100011xx"},
        {"123", 10, 12, true, false, "1100010010xx"},
        {"1", 4, 4, false, true, "1000"},
        {"1", 4, 4, false, false, "0001"},
        {"12", 16, 16, false, false, "00010010xxxxxxxx"},
        {"12", 16, 16, true, false, "xxxxxxxx01001000"},
        {"123", 12, 12, false, true, "010010001100"},
        {"aBcDeF", 24, 24, false, false, "101010111100110111101111"},
        {"a g5", 16, 16, false, false, "10100101xxxxxxxx"},
        {"1 2", 8, 8, false, false, "0010xxxx"},       // twelve bits counted: the digit 1 is cut
        {"1 2", 12, 12, false, true, "10000100xxxx"},  // the pairs are "1 " and "2"
        {" 12", 12, 12, false, true, "10000100xxxx"},  // the pairs are " 1" and "2"
        {"1\xB2\xE1", 12, 12, false, false, "0001xxxxxxxx"},
        {"", 8, 8, false, false, "xxxxxxxx"},
        {"12", 0, 8, false, false, "xxxxxxxx"},
        {"12", -5, 8, true, false, "xxxxxxxx"},
    };
    for (const Case& one : cases) {
        for (const bool before : {false, true}) {
            RLBitVec vector(one.length, before);
            Hex2Bit::convertHexString2BitVec(&vector, one.text, one.size, one.descending, one.byteSwap, false);
            std::string expected = one.indexes;
            for (char& bit : expected) {
                bit = bit == 'x' ? (before ? '1' : '0') : bit;
            }
            EXPECT_EQ(bitsOf(vector), expected) << one.text << ", size " << one.size;
        }
    }
}

TEST_F(Hex2BitLoad, TheFourOrdersInBytes) {
    const unsigned char expected[2][2][2] = {{{0xA5, 0x12}, {0xA5, 0x48}}, {{0x48, 0xA5}, {0x12, 0xA5}}};
    for (const bool descending : {false, true}) {
        for (const bool byteSwap : {false, true}) {
            const auto bytes = Hex2Bit::convertHexString2BinData("12a5", 16, descending, byteSwap);
            EXPECT_EQ(bytes[0], expected[descending][byteSwap][0]);
            EXPECT_EQ(bytes[1], expected[descending][byteSwap][1]);
        }
    }
}

TEST_F(Hex2BitLoad, FillValueAndInitialise) {
    Hex2Bit::setInitValue(true);
    HexModel::NumberedVec vector(12, Numbering::ByteMirror);
    Hex2Bit::convertHexString2BitVec(&vector, "0", 4, false, false, true);
    EXPECT_EQ(bitsOf(vector), "000011111111");
    EXPECT_EQ(vector.data()[1], 0xF0) << "the usual numbering is back, and the slack is filled";

    EXPECT_EQ(bitsOf(*Hex2Bit::convertHexString2BitVec("0", 12, true, false, false)), "111111110000");
    const auto bytes = Hex2Bit::convertBinString2BinData("000", 12, false);
    EXPECT_EQ(bytes[0], 0xFF);
    EXPECT_EQ(bytes[2], 0xFF) << "an array of (12 + 14) / 8 bytes";
}

TEST_F(Hex2BitLoad, LeftFillAddsWholeDigits) {
    EXPECT_EQ(bitsOf(*Hex2Bit::convertHexString2BitVec("1", 16, false, false, true)), "0000000000000001");
    EXPECT_EQ(bitsOf(*Hex2Bit::convertHexString2BitVec("1", 16, false, false, false)), "0001000000000000");
    EXPECT_EQ(bitsOf(*Hex2Bit::convertHexString2BitVec("123", 14, false, false, true)), "00010010001100");
}

TEST_F(Hex2BitLoad, BinaryText) {
    EXPECT_EQ(bitsOf(*Hex2Bit::convertBinString2BitVec("101", 6, false)), "101000");
    EXPECT_EQ(bitsOf(*Hex2Bit::convertBinString2BitVec("101", 6, true)), "000101");
    EXPECT_EQ(bitsOf(*Hex2Bit::convertBinString2BitVec("0x1y0", 4, false)), "0111");
    RLBitVec ones(4, true);
    Hex2Bit::convertBinString2BitVec(&ones, "0000", 4, false);
    EXPECT_EQ(bitsOf(ones), "1111") << "no bit is cleared";
}

TEST_F(Hex2BitLoad, PlainText) {
    EXPECT_EQ(bitsOf(*Hex2Bit::convertString2BitVec("AB", 2, false, false)), "0100000101000010");
    EXPECT_EQ(bitsOf(*Hex2Bit::convertString2BitVec("\x0A\0\x7F", 3, false, false)), "1010000001111111");
    EXPECT_EQ(bitsOf(*Hex2Bit::convertString2BitVec("\x81", 1, false, false)), "11111111111111111111111110000001");
    EXPECT_EQ(Hex2Bit::convertString2BitVec("AB", -1, false, false)->length(), 0U);

    RLBitVec vector(20, false);
    Hex2Bit::convertString2BitVec(&vector, "AB", 2, true, false);
    EXPECT_EQ(bitsOf(vector), "01000010100000100000") << "loaded like any text of 16 bits";
    RLBitVec small(8, false);
    Hex2Bit::convertString2BitVec(&small, "AB", 2, false, false);
    EXPECT_EQ(bitsOf(small), "01000010") << "the left end is lost";
    Hex2Bit::convertBpiHexString2BitVec(&small, "7e", 8, false);
    EXPECT_EQ(bitsOf(small), "01111110");
}

TEST_F(Hex2BitLoad, NullsLeaveEverythingAlone) {
    RLBitVec vector(8, true);
    Hex2Bit::convertHexString2BitVec(&vector, nullptr, 8, false, false, false);
    Hex2Bit::convertBinString2BitVec(&vector, nullptr, 8, false);
    Hex2Bit::convertString2BitVec(&vector, nullptr, 8, false, false);
    EXPECT_EQ(bitsOf(vector), "11111111");
    Hex2Bit::convertHexString2BitVec(nullptr, "12", 8, false, false, true);
    Hex2Bit::convertBinString2BitVec(nullptr, "1", 8, false);
    Hex2Bit::convertString2BitVec(nullptr, "AB", 2, false, false);
    EXPECT_EQ(Hex2Bit::convertHexString2BitVec(nullptr, -8, false, false, true)->length(), 0U);
    EXPECT_NE(Hex2Bit::convertBinString2BinData(nullptr, -8, false), nullptr);
}

#ifdef NDEBUG
TEST_F(Hex2BitLoad, IndexesBeyondTheVectorArePassedOver) {
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

TEST_F(Hex2BitLoad, AllTextsOfTwoCharacters) {
    RLBitVec vector(8);
    for (int code = 0; code < 0x10000; ++code) {
        const std::string text{static_cast<char>(code >> 8), static_cast<char>(code)};
        for (int order = 0; order < 4; ++order) {
            vector = true;
            HexModel::Vector model(vector, Numbering::Usual);
            Hex2Bit::convertHexString2BitVec(&vector, std::string_view(text), 8, order / 2 != 0, order % 2 != 0, false);
            HexModel::loadHex(model, text, 8, order / 2 != 0, order % 2 != 0);
            ASSERT_TRUE(model.matches(vector)) << code << " in order " << order;
        }
    }
}

/// Random loads against the model: all orders, fill values and numberings, foreign characters, cuts, spare length.
class RandomLoads : public Hex2BitLoad, public testing::WithParamInterface<unsigned> {
protected:
    bool chance(unsigned percent) { return m_random() % 100 < percent; }

    std::string text(std::size_t length, const std::string& alphabet, unsigned foreignPercent) {
        std::string result;
        for (std::size_t i = 0; i < length; ++i) {
            result.push_back(chance(foreignPercent) ? static_cast<char>(1 + m_random() % 255)
                                                    : alphabet[m_random() % alphabet.size()]);
        }
        return result;
    }

    void compareOnce(std::size_t size, std::size_t textLength) {
        const auto numbering = static_cast<Numbering>(chance(80) ? 0 : 1 + m_random() % 2);
        HexModel::NumberedVec vector(size + (chance(50) ? m_random() % 70 : 0), numbering);
        vector.LRBitVec::operator=(chance(50));
        HexModel::Vector model(vector, numbering);
        const bool descending = chance(50);
        const bool byteSwap = chance(50);
        const auto places = static_cast<int>(size);
        if (chance(70)) {
            const std::string hex = text(textLength, "0123456789abcdefABCDEF", chance(50) ? 10 : 0);
            Hex2Bit::convertHexString2BitVec(&vector, hex.c_str(), places, descending, byteSwap, false);
            HexModel::loadHex(model, hex, places, descending, byteSwap);
            ASSERT_TRUE(model.matches(vector)) << hex << ", size " << size << descending << byteSwap;
        } else {
            const std::string binary = text(textLength, "01", 5);
            Hex2Bit::convertBinString2BitVec(&vector, binary.c_str(), places, descending);
            HexModel::loadBinary(model, binary, places, descending);
            ASSERT_TRUE(model.matches(vector)) << binary << ", size " << size << descending;
        }
    }

    const unsigned m_seed = GetParam() != 0 ? GetParam() : std::random_device()();
    std::mt19937 m_random{m_seed};
};

TEST_P(RandomLoads, AgreeWithTheModel) {
    SCOPED_TRACE("seed " + std::to_string(m_seed));
    for (std::size_t size = 0; size <= 150 && !HasFatalFailure(); ++size) {
        for (int round = 0; round < 40; ++round) {
            compareOnce(size, m_random() % 64);
        }
    }
    for (int round = 0; round < 40 && !HasFatalFailure(); ++round) {
        compareOnce(m_random() % 30000, m_random() % 9000);
    }
}

INSTANTIATE_TEST_SUITE_P(Seeds, RandomLoads, testing::Values(0U, 1U, 2U));

TEST(HexModelTest, OneWrongBitIsSeen) {
    RLBitVec vector(33);
    Hex2Bit::convertHexString2BitVec(&vector, "123456789", 33, false, false, false);
    HexModel::Vector model(vector, Numbering::Usual);
    model.write(32, !model.read(32));
    EXPECT_FALSE(model.matches(vector));
}

}  // namespace
