// The conversions on data worked out by hand, here and in the tables of docs/bits.md, and on random data against the
// model, with either width of the kernels.
#include "Hex2Bit.h"

#include <gtest/gtest.h>

#include <algorithm>
#include <fstream>
#include <regex>

#include "BitView.h"
#include "MessageRecorder.h"
#include "VectorWidth.h"
#include "bits/Chance.h"
#include "hex/HexChecks.h"

namespace {

using HexChecks::taken;
using Bytes = std::vector<unsigned char>;

class Hex2BitTest : public testing::Test {
protected:
    ~Hex2BitTest() override { Hex2Bit::setInitValue(false); }
};

/// The bits by index, 0 first.
std::string bitsOf(const RLBitVec& vector) {
    return toGroupedText(vector, 0);
}

TEST_F(Hex2BitTest, RandomDataAgreesWithTheModel) {
    const MessageRecorder silent;
    Chance chance;
    for (std::size_t round = 0; round < std::size_t{151} * 90; ++round) {
        const VectorWidth width(chance.coin());
        const bool isLong = round % 151 == 0;
        const std::size_t size = isLong ? chance.below(30000) : round % 151;
        const std::string places{static_cast<char>(size % 256), static_cast<char>(size / 256)};
        const std::string data = chance.below(4) != 0 ? chance.digits(chance.below(isLong ? 9000 : 140))
                                                      : chance.bytes(chance.below(isLong ? 4000 : 20));
        const std::string input = chance.bytes(1) + places + chance.bytes(1) + data;
        ASSERT_TRUE(HexChecks::allAgree(Input(input))) << testing::PrintToString(input);
    }
}

using Cells = std::vector<std::string>;

/// The cells, without the blanks and back quotes around them, of the guide's table rows that begin with an example and
/// have so many.
std::vector<Cells> guideRows(std::size_t cellCount) {
    const std::regex cell("\\|[ `]*([^|]*?)[ `]*(?=\\|)");
    std::ifstream guide(TEST_DATA_DIR "/../../docs/bits.md");
    std::vector<Cells> rows;
    for (std::string line; std::getline(guide, line);) {
        const Cells cells(std::sregex_token_iterator(line.begin(), line.end(), cell, 1), {});
        if (line.rfind("| `", 0) == 0 && cells.size() == cellCount) {
            rows.push_back(cells);
        }
    }
    return rows;
}

TEST_F(Hex2BitTest, LoadsBecomeWhatTheGuideSays) {
    const auto rows = guideRows(7);
    ASSERT_EQ(rows.size(), 10U);
    for (const Cells& row : rows) {
        RLBitVec vector(std::stoul(row[1]));
        Hex2Bit::convertHexString2BitVec(&vector, row[0].c_str(), std::stoi(row[2]), row[3] == "true", row[4] == "true",
                                         false);
        EXPECT_EQ(bitsOf(vector), row[5]) << testing::PrintToString(row);
        EXPECT_STRCASEEQ(hexDump(vector).c_str(), ("       0  " + row[6] + "\n").c_str());
    }
}

TEST_F(Hex2BitTest, TextsBecomeWhatTheGuideSays) {
    const auto bytes = Hex2Bit::convertHexString2BinData("A10F", 16, true, true);
    const auto rows = guideRows(5);
    ASSERT_EQ(rows.size(), 6U);
    for (const Cells& row : rows) {
        const char* const text =
            Hex2Bit::convertBinData2HexString(bytes.get(), std::stoi(row[1]), row[2] == "true", row[3] == "true");
        EXPECT_EQ(row[0] + taken(text), "A1 0F" + row[4]) << testing::PrintToString(row);
    }
}

TEST_F(Hex2BitTest, ByteBuffersAreMirrored) {
    Chance chance;
    for (int count = 0; count <= 140; ++count) {
        const std::string random = chance.bytes(static_cast<std::size_t>(count));
        Bytes expected(random.begin(), random.end());
        std::transform(expected.begin(), expected.end(), expected.begin(), HexModel::mirrored);
        for (const bool isWide : {false, true}) {
            const VectorWidth width(isWide);
            Bytes buffer(random.begin(), random.end());
            const std::unique_ptr<unsigned char[]> copy(Hex2Bit::reverseBufferBits(buffer.data(), count));
            EXPECT_EQ(Bytes(copy.get(), copy.get() + count), expected);
            Hex2Bit::reverseReadBufferBits(buffer.data(), count);
            EXPECT_EQ(buffer, expected);
        }
    }
    EXPECT_NE(std::unique_ptr<unsigned char[]>(Hex2Bit::reverseBufferBits(nullptr, -1)), nullptr);
    Hex2Bit::reverseReadBufferBits(nullptr, 3);
    EXPECT_EQ(Hex2Bit::swapBits(0x12), 0x48);
}

TEST_F(Hex2BitTest, NeighbouringBytesAreSwapped) {
    Bytes five{1, 2, 3, 4, 5};
    EXPECT_EQ(Hex2Bit::swapBytes(five.data(), 5), five.data());
    EXPECT_EQ(five, (Bytes{2, 1, 4, 3, 5}));
    EXPECT_EQ(Hex2Bit::swapBytes(nullptr, 4), nullptr);
}

TEST_F(Hex2BitTest, TextsAndNumbersOfWhatIsMissingOrEmpty) {
    const unsigned char bytes[] = {0xA1, 0x0F};
    EXPECT_EQ(taken(Hex2Bit::convertBinData2BinString(nullptr, 12, true)), "");
    EXPECT_EQ(taken(Hex2Bit::convertBinData2HexString(bytes, -1, true, true)), "");
    EXPECT_EQ(taken(Hex2Bit::convertBinString2HexString("1010", 0, true)), "");
    EXPECT_EQ(taken(Hex2Bit::convertBinString2HexString(nullptr, 8, true)), "00");
    EXPECT_EQ(taken(Hex2Bit::convertBinString2HexString("11110000", false)), "f0");
    EXPECT_EQ(Hex2Bit::convertBin2Int(bytes, -1), 0);
    EXPECT_EQ(Hex2Bit::convertBin2Int(nullptr, 8), 0);
    EXPECT_EQ(Hex2Bit::convertHexString2Int("12", -3), 0);
    Hex2Bit::setInitValue(true);
    EXPECT_EQ(Hex2Bit::convertHexString2Int(nullptr, 2), 0xFF);
}

TEST_F(Hex2BitTest, NumbersIntoNewVectors) {
    EXPECT_EQ(Hex2Bit::convertInt2BitVec(0xB, 8)->data()[0], 0x0B);
    EXPECT_EQ(Hex2Bit::convertLong2BitVec(0x1FF, 4)->data()[0], 0x0F);
    EXPECT_EQ(Hex2Bit::convertInt2BitVec(-1, 8)->data()[0], 0x00);
    EXPECT_EQ(Hex2Bit::convertInt2BitVec(5, -1)->length(), 0U);
    Hex2Bit::setInitValue(true);
    EXPECT_EQ(Hex2Bit::convertInt2BitVec(0xB, 8)->data()[0], 0xFF);
}

TEST_F(Hex2BitTest, WidthsOnBothSidesOfEachStep) {
    // Worked out for every value there is: the widths, multiples of 4, grow by 4 behind these values and nowhere else.
    std::size_t width = 0;
    for (const int last : {0, 14, 254, 4094, 65534, 1048574, 16777199, 268435208}) {
        EXPECT_EQ(Hex2Bit::convertInt2BitVec(last)->length(), width) << last;
        width += 4;
        EXPECT_EQ(Hex2Bit::convertInt2BitVec(last + 1)->length(), width) << last + 1;
    }
    EXPECT_EQ(Hex2Bit::convertInt2BitVec(0x7FFFFFFF)->length(), width);
}

TEST_F(Hex2BitTest, NumbersToText) {
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

TEST_F(Hex2BitTest, VectorsToCharacters) {
    const MessageRecorder messages;
    char out[8] = "before";
    const auto plain = Hex2Bit::convertString2BitVec("AB", 2, false, false);
    EXPECT_TRUE(Hex2Bit::convertBitVec2String(plain.get(), out));
    EXPECT_FALSE(Hex2Bit::convertBitVec2String(Hex2Bit::convertString2BitVec("A\xF2", 2, false, false).get(), out));
    EXPECT_STREQ(out, "A");
    EXPECT_EQ(messages.status(), std::vector<std::string>{" The binary data cannot be displayed"});
    EXPECT_TRUE(Hex2Bit::convertBitVec2String(nullptr, out));
    EXPECT_STREQ(out, "");
    EXPECT_FALSE(Hex2Bit::convertBitVec2String(plain.get(), nullptr));
}

TEST_F(Hex2BitTest, OutsideTheVectorThereAreNoHexDigits) {
    const RLBitVec vector(32);
    EXPECT_EQ(taken(Hex2Bit::getHexStringByHexAddress(&vector, 0, -2, 8)), "");
    for (const int address : {4, -1, 0x7FFFFFFF}) {
        EXPECT_EQ(Hex2Bit::getHexStringByHexAddress(&vector, address, 2, 8), nullptr) << address;
    }
    EXPECT_EQ(Hex2Bit::getHexStringByHexAddress(nullptr, 0, 2, 8), nullptr);
}

TEST_F(Hex2BitTest, NewVectors) {
    const std::pair<std::unique_ptr<RLBitVec>, const char*> cases[] = {
        {Hex2Bit::convertHexString2BitVec("1", 16, false, false, true), "0000000000000001"},
        {Hex2Bit::convertHexString2BitVec("1", 16, false, false, false), "0001000000000000"},
        {Hex2Bit::convertBinString2BitVec("101", 6, true), "000101"},
        {Hex2Bit::convertString2BitVec("\x0A\0\x7F", 3, false, false), "1010000001111111"},
        {Hex2Bit::convertString2BitVec("\x81", 1, false, false), "11111111111111111111111110000001"},
        {Hex2Bit::convertString2BitVec("AB", -1, false, false), ""},
        {Hex2Bit::convertHexString2BitVec(nullptr, -8, false, false, true), ""}};
    for (const auto& [vector, bits] : cases) {
        EXPECT_EQ(bitsOf(*vector), bits);
    }
    EXPECT_NE(Hex2Bit::convertBinString2BinData(nullptr, -8, false), nullptr);
}

TEST_F(Hex2BitTest, FillValueAndInitialise) {
    Hex2Bit::setInitValue(true);
    NumberedVec vector(12, Numbering::Mirrored);
    Hex2Bit::convertHexString2BitVec(&vector, "0", 4, false, false, true);
    EXPECT_EQ(bitsOf(vector), "000011111111");
    EXPECT_EQ(vector.data()[1], 0xF0) << "the usual numbering is back, and the slack is filled";
    EXPECT_EQ(bitsOf(*Hex2Bit::convertHexString2BitVec("0", 12, true, false, false)), "111111110000");
    const auto bytes = Hex2Bit::convertBinString2BinData("000", 12, false);
    EXPECT_EQ(bytes[0] & bytes[2], 0xFF) << "an array of (12 + 14) / 8 bytes";
}

TEST_F(Hex2BitTest, PlainTextIntoHeldVectors) {
    RLBitVec vector(20);
    Hex2Bit::convertString2BitVec(&vector, "AB", 2, true, false);
    EXPECT_EQ(bitsOf(vector), "01000010100000100000") << "loaded like any text of 16 bits";
    RLBitVec small(8);
    Hex2Bit::convertString2BitVec(&small, "AB", 2, false, false);
    EXPECT_EQ(bitsOf(small), "01000010") << "the left end is lost";
    Hex2Bit::convertBpiHexString2BitVec(&small, "7e", 8, false);
    EXPECT_EQ(bitsOf(small), "01111110");
}

TEST_F(Hex2BitTest, NullTextsAndVectorsAndNoSizeLeaveEverythingAlone) {
    RLBitVec vector(8, true);
    Hex2Bit::convertHexString2BitVec(&vector, nullptr, 8, false, false, false);
    Hex2Bit::convertHexString2BitVec(&vector, "12", -5, true, false, false);
    Hex2Bit::convertBinString2BitVec(&vector, nullptr, 8, false);
    Hex2Bit::convertString2BitVec(&vector, nullptr, 8, false, false);
    EXPECT_EQ(bitsOf(vector), "11111111");
    Hex2Bit::convertHexString2BitVec(nullptr, "12", 8, false, false, true);
    Hex2Bit::convertBinString2BitVec(nullptr, "1", 8, false);
    Hex2Bit::convertString2BitVec(nullptr, "AB", 2, false, false);
    Hex2Bit::convertInt2BitVec(5, 0, nullptr);
    Hex2Bit::convertInt2BitVec(5U, 0, nullptr);
}

}  // namespace
