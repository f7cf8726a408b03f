// Row checksums: the arithmetic against a bit-by-bit sum, the fill, the verdicts and the dump.

#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include <memory>
#include <random>

#include "EnvironmentVariable.h"
#include "MessageRecorder.h"
#include "PromUtility.h"
#include "bits/Model.h"
#include "s/ByteSum.h"

namespace {

using testing::ElementsAre;

struct Sums {
    int file = 0;
    int device = 0;
};

/// One row for both sides; the text of the last row, empty otherwise.
std::string addRow(Sums& sums, RLBitVec& row, int bits, bool last = false, int done = 0, int total = 0) {
    const std::unique_ptr<char[]> text(
        PromUtility::rowChecksum(0, &row, bits, &row, bits, last, sums.file, sums.device, done, total));
    return text != nullptr ? text.get() : "";
}

TEST(RowChecksum, EqualsTheSumBitByBitInAnyNumbering) {
    std::mt19937 random(20261124);
    for (const int bits : {8, 16, 64, 72, 1000, 1024, 4096, 10008}) {
        for (const int longer : {0, 1, 8, 13, 16}) {
            NumberedVec row(static_cast<std::size_t>(bits + longer),
                            longer == 16 ? Numbering::Mirrored : Numbering::Usual);
            unsigned int sum = 0;
            for (int i = 0; i < bits; ++i) {
                row[static_cast<std::size_t>(i)] = random() % 2 != 0;
                sum += row.testBit(static_cast<std::size_t>(i)) ? 1U << (bits - 1 - i) % 8 : 0U;
            }
            Sums sums{5, -5};
            addRow(sums, row, bits);
            EXPECT_EQ(sums.file, 5 + static_cast<int>(sum)) << bits << " bits of a vector " << longer << " longer";
            EXPECT_EQ(sums.device, -5 + static_cast<int>(sum)) << bits << " bits of a vector " << longer << " longer";
        }
    }
}

TEST(RowChecksum, ByteSumsAgreeAtEveryLength) {
    std::vector<unsigned char> bytes(700, 0xFF);
    for (std::size_t count = 0; count <= bytes.size(); ++count) {
        ASSERT_EQ(sumBytes(bytes.data(), count), 255 * count);
        ASSERT_EQ(sumBytesPortably(bytes.data(), count), 255 * count);
    }
}

TEST(RowChecksum, TheLastRowFillsTheRestAndGivesTheDeviceSum) {
    RLBitVec row(8);
    Sums sums;
    EXPECT_EQ(addRow(sums, row, 8, true, 16, 40), "0000001fe");
    EXPECT_EQ(sums.file, 510);
    addRow(sums, row, 8, true, 32, 40);
    EXPECT_EQ(sums.file, 510) << "nothing left to fill";
    addRow(sums, row, 8, true, 32, 41);
    EXPECT_EQ(sums.file, 765) << "a part of a byte counts whole";
    sums = {-1, 0};
    addRow(sums, row, 0, true, 0, 2147483647);
    EXPECT_EQ(static_cast<unsigned int>(sums.device), 255U * 268435456U);
    EXPECT_EQ(static_cast<unsigned int>(sums.file), 255U * 268435456U - 1U);
}

TEST(RowChecksum, VerdictsAreReportedAndNoRowLeavesTheSums) {
    RLBitVec none(0);
    const MessageRecorder messages;
    for (Sums sums : {Sums{0, 255}, {-1, -1}, {2, 1}}) {
        addRow(sums, none, 0, true);
    }
    EXPECT_THAT(messages.status(), ElementsAre("Device checksum is  0000000ff\n",
                                               "Calculated checksum matches expected checksum, 0ffffffff\n"));
    EXPECT_EQ(messages.errors().size(), 1U);
    Sums sums;
    EXPECT_EQ(PromUtility::rowChecksum(0, nullptr, 8, nullptr, 8, false, sums.file, sums.device, 0, 0), nullptr);
    EXPECT_TRUE(sums.file == 0 && sums.device == 0);
}

TEST(RowChecksum, TheDumpShowsTheFilesBitsAndTheFill) {
    const EnvironmentVariable variable("ZRX_TESSAL_ZQ7300DUMPCHECKSUMDATA", "0");
    RLBitVec row(8);
    row.setBit(7);
    row.setBit(5);
    Sums sums;
    const MessageRecorder messages;
    testing::internal::CaptureStdout();
    addRow(sums, row, 8, true, 0, 24);
    EXPECT_EQ(testing::internal::GetCapturedStdout(),
              "Current Size 8File Checksum is 5Device Checksum is 5\n"
              "Current Size 16File Checksum is 260Device Checksum is 260\n");
    EXPECT_EQ(messages.status().at(7), "File Checksum is 5, i is -1\n");
}

}  // namespace
