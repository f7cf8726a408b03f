// Byte buffers, numbers and the conversions back to text.
#include <gtest/gtest.h>

#include <memory>
#include <random>
#include <string>
#include <vector>

#include "Hex2Bit.h"
#include "MessageRecorder.h"
#include "hex/HexModel.h"

namespace {

using HexModel::Numbering;
using Bytes = std::vector<unsigned char>;

/// The text of a new array, which is released.
std::string taken(const char* text) {
    const std::unique_ptr<const char[]> owner(text);
    return text != nullptr ? text : "(null)";
}

std::unique_ptr<RLBitVec> vectorOf(const char* hex) {
    return Hex2Bit::convertHexString2BitVec(hex, static_cast<int>(4 * std::string(hex).size()), false, false, false);
}

class Hex2BitTest : public testing::Test {
protected:
    ~Hex2BitTest() override { Hex2Bit::setInitValue(false); }

    Bytes randomBytes(std::size_t count) {
        Bytes bytes(count);
        for (unsigned char& byte : bytes) {
            byte = static_cast<unsigned char>(m_random());
        }
        return bytes;
    }

    const unsigned m_seed = std::random_device()();
    std::mt19937 m_random{m_seed};
    testing::ScopedTrace m_trace{__FILE__, __LINE__, "seed " + std::to_string(m_seed)};
};

TEST_F(Hex2BitTest, ByteBuffers) {
    Bytes bytes{0x01, 0x81, 0x0F, 0x12};
    const Bytes mirrored{0x80, 0x81, 0xF0, 0x48};
    const std::unique_ptr<unsigned char[]> copy(Hex2Bit::reverseBufferBits(bytes.data(), 4));
    EXPECT_EQ(Bytes(copy.get(), copy.get() + 4), mirrored);
    EXPECT_EQ(bytes[0], 0x01) << "the source stays";
    Hex2Bit::reverseReadBufferBits(bytes.data(), 4);
    EXPECT_EQ(bytes, mirrored);
    EXPECT_EQ(Hex2Bit::swapBits(0x12), 0x48);

    Bytes five{1, 2, 3, 4, 5};
    EXPECT_EQ(Hex2Bit::swapBytes(five.data(), 5), five.data());
    EXPECT_EQ(five, (Bytes{2, 1, 4, 3, 5}));

    const std::unique_ptr<unsigned char[]> none(Hex2Bit::reverseBufferBits(bytes.data(), -1));
    EXPECT_NE(none, nullptr);
    Hex2Bit::reverseReadBufferBits(nullptr, 3);
    EXPECT_EQ(Hex2Bit::swapBytes(nullptr, 4), nullptr);
}

TEST_F(Hex2BitTest, WorkedTexts) {
    const unsigned char bytes[] = {0xA1, 0x0F};
    EXPECT_EQ(taken(Hex2Bit::convertBinData2HexString(bytes, 16, false, false)), "0fa1");
    EXPECT_EQ(taken(Hex2Bit::convertBinData2HexString(bytes, 16, false, true)), "f085");
    EXPECT_EQ(taken(Hex2Bit::convertBinData2HexString(bytes, 16, true, false)), "85f0");
    EXPECT_EQ(taken(Hex2Bit::convertBinData2HexString(bytes, 16, true, true)), "a10f");
    EXPECT_EQ(taken(Hex2Bit::convertBinData2BinString(bytes, 12, false)), "111110100001");
    EXPECT_EQ(taken(Hex2Bit::convertBinData2BinString(bytes, 12, true)), "100001011111");
    EXPECT_EQ(taken(Hex2Bit::convertBinData2BinString(nullptr, 12, true)), "");
    EXPECT_EQ(taken(Hex2Bit::convertBinData2HexString(bytes, -1, true, true)), "");

    EXPECT_EQ(taken(Hex2Bit::convertBinString2HexString("1010", 4, false)), "a");
    EXPECT_EQ(taken(Hex2Bit::convertBinString2HexString("1010", 4, true)), "05");
    EXPECT_EQ(taken(Hex2Bit::convertBinString2HexString("1x01", 9, false)), "900") << "what is missing counts as 0";
    EXPECT_EQ(taken(Hex2Bit::convertBinString2HexString("1010", 0, true)), "");
    EXPECT_EQ(taken(Hex2Bit::convertBinString2HexString(nullptr, 8, true)), "00");
    EXPECT_EQ(taken(Hex2Bit::convertBinString2HexString("11110000", false)), "f0");
}

TEST_F(Hex2BitTest, BytesToTextAgreesWithTheModel) {
    const auto compare = [&](int bits) {
        const Bytes bytes = randomBytes(static_cast<std::size_t>(bits + 7) / 8);
        for (const bool positionOrder : {false, true}) {
            const std::string binary = HexModel::binaryText(bytes.data(), bits, positionOrder);
            ASSERT_EQ(taken(Hex2Bit::convertBinData2BinString(bytes.data(), bits, positionOrder)), binary);
            for (const bool byteMode : {false, true}) {
                const std::string hex = HexModel::hexText(binary, byteMode);
                ASSERT_EQ(taken(Hex2Bit::convertBinData2HexString(bytes.data(), bits, positionOrder, byteMode)), hex);
                ASSERT_EQ(taken(Hex2Bit::convertBinString2HexString(binary.c_str(), bits, byteMode)), hex);
            }
        }
        const RLBitVec vector(bytes.data(), static_cast<std::size_t>(bits));
        ASSERT_EQ(Hex2Bit::convertBin2Int(bytes.data(), bits), HexModel::number({vector, Numbering::Usual}));
    };
    for (int bits = 0; bits <= 150; ++bits) {
        compare(bits);
    }
    for (const int bits : {4095, 4096, 8191, 20001}) {
        compare(bits);
    }
}

TEST_F(Hex2BitTest, HexTextToNumbers) {
    struct Case {
        const char* text;
        int digits;
        int number;
        int filled;  ///< with ones as the fill value
    };
    const Case cases[] = {
        {"1234", 4, 0x1234, 0x1234},
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
            EXPECT_EQ(HexModel::number({*vector, Numbering::Usual}), fill ? one.filled : one.number) << "by a vector";
        }
    }
    const unsigned char bytes[] = {0x12, 0x34, 0xFF, 0xFF};
    EXPECT_EQ(Hex2Bit::convertBin2Int(bytes, 12), 0x412);
    EXPECT_EQ(Hex2Bit::convertBin2Long(bytes, 32), 0x7FFF3412);
    EXPECT_EQ(Hex2Bit::convertBin2Int(bytes, -1), 0);
    EXPECT_EQ(Hex2Bit::convertBin2Int(nullptr, 8), 0);
}

TEST_F(Hex2BitTest, NumbersIntoHeldVectorsAgreeWithTheModel) {
    const std::uint32_t values[] = {0, 1, 0xB, 0xFF, 0x12345678, 0x7FFFFFFF, 0x80000000, 0xFFFFFFFF};
    for (const Numbering numbering : {Numbering::Usual, Numbering::Forward, Numbering::ByteMirror}) {
        for (const std::size_t length : {0U, 1U, 4U, 8U, 31U, 32U, 33U, 70U}) {
            for (const std::uint32_t value : values) {
                for (int form = 0; form < 8; ++form) {
                    const bool fromIndexZero = form % 2 != 0;
                    const bool isSigned = form / 2 % 2 != 0;
                    Hex2Bit::setInitValue(form / 4 != 0);
                    HexModel::NumberedVec vector(length, numbering);
                    if (isSigned) {
                        Hex2Bit::convertInt2BitVec(static_cast<int>(value), 9, &vector, fromIndexZero);
                    } else {
                        Hex2Bit::convertInt2BitVec(value, 9, &vector, fromIndexZero);
                    }
                    HexModel::NumberedVec filled(length, numbering);
                    filled.LRBitVec::operator=(Hex2Bit::m_initValue);
                    HexModel::Vector model(filled, numbering);
                    const bool ignored = isSigned && value > 0x7FFFFFFF;
                    HexModel::writeNumber(model, ignored ? 0 : value, fromIndexZero);
                    ASSERT_TRUE(model.matches(vector)) << value << " in " << length << ", form " << form;
                }
            }
        }
    }
    Hex2Bit::convertInt2BitVec(5, 0, nullptr);
    Hex2Bit::convertInt2BitVec(5U, 0, nullptr);
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
    struct Range {
        int first;
        int last;
        std::size_t width;
    };
    // Worked out for every value there is: the widths change here and nowhere else.
    const Range ranges[] = {{0, 0, 0},
                            {1, 14, 4},
                            {15, 254, 8},
                            {255, 4094, 12},
                            {4095, 65534, 16},
                            {65535, 1048574, 20},
                            {1048575, 16777199, 24},
                            {16777200, 268435208, 28},
                            {268435209, 0x7FFFFFFF, 32}};
    for (const Range& range : ranges) {
        EXPECT_EQ(Hex2Bit::convertInt2BitVec(range.first)->length(), range.width) << range.first;
        EXPECT_EQ(Hex2Bit::convertInt2BitVec(range.last)->length(), range.width) << range.last;
    }
    for (int k = 1; k < 31; ++k) {
        const auto power = 1U << k;
        const std::size_t needed = static_cast<std::size_t>(k + 3) / 4 * 4;
        EXPECT_EQ(Hex2Bit::convertInt2BitVec(static_cast<int>(power - 1))->length(), k % 4 == 0 ? needed + 4 : needed);
        EXPECT_EQ(Hex2Bit::convertInt2BitVec(static_cast<int>(power))->length(),
                  static_cast<std::size_t>(k + 4) / 4 * 4);
    }
}

TEST_F(Hex2BitTest, NumbersToText) {
    const std::pair<int, const char*> texts[] = {{0, "00000000"}, {1, "1"},     {5, "5"},
                                                 {14, "e"},       {15, "0f"},   {16, "10"},
                                                 {255, "0ff"},    {256, "100"}, {0x7FFFFFFF, "7fffffff"},
                                                 {-1, "00000000"}};
    const char* const first = Hex2Bit::convertInt2HexString(255);
    for (const auto& [value, text] : texts) {
        EXPECT_STREQ(Hex2Bit::convertInt2HexString(value), text);
    }
    EXPECT_EQ(Hex2Bit::convertInt2HexString(255), first) << "a text is kept once";
    EXPECT_STREQ(first, "0ff");

    EXPECT_EQ(taken(Hex2Bit::swapWord(0x12345678)), "56781234");
    EXPECT_EQ(taken(Hex2Bit::swapWord(1)), "00010000");
    EXPECT_EQ(taken(Hex2Bit::swapWord(-2)), "00000000");
    Hex2Bit::setInitValue(true);
    EXPECT_EQ(taken(Hex2Bit::swapWord(1)), "ffffffff");
    EXPECT_STREQ(Hex2Bit::convertInt2HexString(1), "f");
}

TEST_F(Hex2BitTest, VectorsToCharacters) {
    struct Case {
        const char* hex;
        bool stop;
        const char* text;
        bool result;
    };
    const Case cases[] = {
        {"4142", true, "AB", true},    {"41f2", true, "A", false},   {"414", true, "A", true},
        {"41f243", false, "AC", true}, {"410043", true, "AC", true}, {"", true, "", true},
        {"7f80", true, "\x7F", false},
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

TEST_F(Hex2BitTest, HexDigitsAtAnAddress) {
    const unsigned char bytes[] = {0xA1, 0x0F, 0x33, 0xCC};
    const RLBitVec vector(bytes, 32);
    EXPECT_EQ(taken(Hex2Bit::getHexStringByHexAddress(&vector, 0, 2, 8)), "a1");
    EXPECT_EQ(taken(Hex2Bit::getHexStringByHexAddress(&vector, 1, 2, 8)), "0f");
    EXPECT_EQ(taken(Hex2Bit::getHexStringByHexAddress(&vector, 0, 8, 8)), "a10f33cc");
    EXPECT_EQ(taken(Hex2Bit::getHexStringByHexAddress(&vector, 3, 6, 8)), "cc0000") << "nothing behind the end";
    EXPECT_EQ(taken(Hex2Bit::getHexStringByHexAddress(&vector, 0, -2, 8)), "");
    for (const int address : {4, 5, -1, 0x7FFFFFFF}) {
        EXPECT_EQ(Hex2Bit::getHexStringByHexAddress(&vector, address, 2, 8), nullptr) << address;
    }
    EXPECT_EQ(Hex2Bit::getHexStringByHexAddress(nullptr, 0, 2, 8), nullptr);
}

TEST_F(Hex2BitTest, VectorsToTextAgreeWithTheModel) {
    for (const Numbering numbering : {Numbering::Usual, Numbering::Forward, Numbering::ByteMirror}) {
        for (std::size_t length = 1; length <= 150; ++length) {
            HexModel::NumberedVec vector(length, numbering);
            for (std::size_t i = 0; i < length; ++i) {
                if (m_random() % 4 == 0) {
                    vector.setBit(i);
                }
            }
            const HexModel::Vector model(vector, numbering);
            const auto address = static_cast<int>(m_random() % length);
            const auto digits = static_cast<int>(2 * (m_random() % 20));
            ASSERT_EQ(taken(Hex2Bit::getHexStringByHexAddress(&vector, address, digits, 1)),
                      HexModel::hexAt(model, static_cast<std::size_t>(address), digits));
            for (const bool stop : {false, true}) {
                const MessageRecorder silent;
                std::string expected;
                std::vector<char> out(length / 8 + 1);
                const bool result = HexModel::characters(model, stop, expected);
                ASSERT_EQ(Hex2Bit::convertBitVec2String(&vector, out.data(), stop), result);
                ASSERT_EQ(out.data(), expected);
            }
        }
    }
}

}  // namespace
