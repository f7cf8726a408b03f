// What the random operations do not reach: construction, printing, views, refused sizes, and examples worked by hand.
#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include <new>
#include <sstream>

#include "BitView.h"
#include "HkFile.h"
#include "HkStream.h"
#include "MessageRecorder.h"

namespace {

template <class Vector>
Vector from(const char* storageBits) {
    Vector vector;
    for (; *storageBits != '\0'; ++storageBits) {
        vector.addBit(*storageBits == '1');
    }
    return vector;
}

std::string storage(const LRBitVec& vector) {
    return toGroupedText(vector, 0);
}

template <class Vector>
class BothVectors : public testing::Test {};
using Vectors = testing::Types<LRBitVec, RLBitVec>;
TYPED_TEST_SUITE(BothVectors, Vectors, );

TYPED_TEST(BothVectors, HaveTheSizesOfTheirConstructionAndOfAMove) {
    const unsigned char bytes[]{0xA1, 0x0F, 0xFF};
    const TypeParam ones(9, true);
    EXPECT_EQ(TypeParam(0).getCapacity(), 7U);
    EXPECT_EQ(ones.getCapacity(), 16U);
    EXPECT_EQ(ones.data()[1], 0xFF);
    EXPECT_EQ(hexDump(TypeParam(bytes, 12)), "       0  a1 0f\n");
    EXPECT_EQ(TypeParam(nullptr, 12).count(), 0U);

    TypeParam source = from<TypeParam>("10110");
    TypeParam target(std::move(source));
    EXPECT_EQ(storage(target), "10110");
    EXPECT_EQ(source.getCapacity() + source.length(), 0U);  // NOLINT(bugprone-use-after-move)
    EXPECT_EQ(TypeParam(source).data(), nullptr);
    source = target;
    EXPECT_EQ(source.length(), 0U) << "without an array nothing is assigned";
    source.addBit(true);
    EXPECT_EQ(source.getCapacity(), 8U);
}

TYPED_TEST(BothVectors, RefuseSizesThatCannotBe) {
    const std::size_t huge = ~std::size_t{0};
    TypeParam vector = from<TypeParam>("101");
    EXPECT_THROW(TypeParam{huge}, std::bad_array_new_length);
    EXPECT_THROW(vector.resize(huge / 2 + 1), std::bad_array_new_length);
    EXPECT_THROW(vector.setCapacity(huge), std::bad_array_new_length);
    vector += static_cast<const char*>(nullptr);
    vector.addHex(std::string_view());
    EXPECT_EQ(storage(vector), "101");
#ifdef NDEBUG
    vector.setNumberBits(9);
    vector.setSize(9, true);
    vector ^= TypeParam(0);
    vector.rightShift(1000);
    EXPECT_EQ(storage(vector), "000");
    vector.setCapacity(2);
    EXPECT_EQ(vector.length(), 2U);
#endif
}

TYPED_TEST(BothVectors, PrintFromStoragePositionZeroUp) {
    const MessageRecorder recorder;
    from<TypeParam>("100101").printData(true, 5);
    EXPECT_THAT(recorder.status(), testing::ElementsAre("[\n", "  "));
    EXPECT_THAT(recorder.debug(), testing::ElementsAre("1 ", "0 ", "0 ", "1 ", "0 ", "\n  ", "1 ", "\n]\n"));

    std::ostringstream stream;
    testing::internal::CaptureStdout();
    HkFile::getCout() << TypeParam(26, true);
    stream << TypeParam(26, true);
    EXPECT_EQ(stream.str(), "[\n  1 1 1 1 1 1 1 1 1 1 1 1 1 1 1 1 1 1 1 1 1 1 1 1 1 \n  1 \n]\n");
    EXPECT_EQ(testing::internal::GetCapturedStdout(), stream.str());
}

// The model of the random operations reads both the same way; these are written down from the right end.
TEST(RLBitVec, AppendsBehindItsRightEndAndShiftsTowardsTheEndsAsRead) {
    RLBitVec vector = from<RLBitVec>("1100");
    vector += from<RLBitVec>("101");
    EXPECT_EQ(storage(vector), "1011100");
    vector << 2;
    EXPECT_EQ(storage(vector), "0010111");
    vector >> 3;
    EXPECT_EQ(storage(vector), "0111000");
    EXPECT_EQ(storage(static_cast<LRBitVec&>(vector) >> 1), "0011100");
}

TEST(RLBitVec, TakesFieldsAsTextAndRefusesThoseThatDoNotFit) {
    RLBitVec vector(16);
    vector.updateBitField("1x11", 2);
    vector.updateBitField("", 2);
    vector.updateBitField(static_cast<const char*>(nullptr), 2);
    vector.updateBitField(static_cast<const char*>(nullptr), 2, 8, true);
    vector.updateBitField(static_cast<const RLBitVec*>(nullptr), 2, true);
    vector.updateBitField(0xFFU, 3, -1, true);
#ifdef NDEBUG
    vector.updateBitField(0xFFU, -1, 4, true);
    vector.updateBitField(0xFFU, 20, 4, true);
    vector.updateBitField(0xFFU, 0, 33, true);
    vector.updateBitField("111111111111111111111111111111111", 0);
#endif
    EXPECT_EQ(storage(vector), "0010110000000000");
}

TEST(BitView, ShowsGroupsDumpsAndDifferences) {
    const auto left = from<LRBitVec>("1010010111");
    EXPECT_EQ(toGroupedText(RLBitVec(left)), "11_1010_0101");
    EXPECT_EQ(toGroupedText(left, 5, ' '), "10100 10111");
    EXPECT_EQ(hexDump(LRBitVec(130, true)),
              "       0  ff ff ff ff ff ff ff ff ff ff ff ff ff ff ff ff\n     128  03\n");
    EXPECT_EQ(hexDump(LRBitVec()), "");
    EXPECT_EQ(difference(left, left), "");
    EXPECT_EQ(difference(LRBitVec(64), LRBitVec(66)),
              "2 of 66 bits differ\n      64  --\n          00\n          ^^\n");
}

}  // namespace
