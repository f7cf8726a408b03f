#include <gtest/gtest.h>

#include <string>
#include <tuple>

#include "BitView.h"
#include "EnvironmentVariable.h"
#include "Register.h"

namespace {

const unsigned char addressBytes[]{0xA5};
const unsigned char dataBytes[]{0x3C, 0x00};

std::string total(Register& reg) {
    return toGroupedText(*reg.getRegister(), 0);
}

TEST(Register, JoinsItsPartsAndSplitsTheTotalOnlyWhenToldThatItChanged) {
    Register reg(8, addressBytes, 8, dataBytes, 4, 0x3);
    EXPECT_EQ(total(reg), "10100101001111000011");
    reg.setStatus(0xFFFFFFFA);
    const unsigned char other[]{0x81};
    reg.setData(other, 8);
    const RLBitVec address(8, true);
    reg.setAddress(&address);
    EXPECT_EQ(total(reg), "11111111100000011010");
    *reg.getRegister() = RLBitVec(20, true);
    EXPECT_EQ(reg.getData()[0], 0x81);
    reg.updateData();
    EXPECT_EQ(reg.getData()[0] & reg.getAddress()[0], 0xFF);
    EXPECT_EQ(reg.getStatus(), 15);
    reg.getStatus(false)->clearBit(0);
    reg.updateTotalData();
    EXPECT_EQ(total(reg), "11111111111111110111");

    Register ofDataAlone(0, nullptr, 8, dataBytes, 0, 0);
    const RLBitVec longer(11, true);
    ofDataAlone.setData(&longer);
    EXPECT_EQ(total(ofDataAlone), "11111111111");
    ofDataAlone.getRegister()->resize(3);
    ofDataAlone.updateData();
    EXPECT_EQ(ofDataAlone.getDataVector()->length(), 3U) << "follows the length";
}

TEST(Register, ReadsTheLow31BitsOfTheStatusWithSign) {
    const std::tuple<int, unsigned, int> cases[]{{0, 5, 0},           {31, 0x40000000, -0x40000000},
                                                 {32, 0x80000001, 1}, {32, 0xFFFFFFFF, -1},
                                                 {40, 5, 5},          {40, 0x12345678, 0x12345678}};
    for (const auto& [size, status, read] : cases) {
        Register reg(4, 4, size);
        reg.setStatus(status);
        EXPECT_EQ(reg.getStatus(), read) << status << " in " << size << " bits";
    }
}

TEST(Register, ComparesWithoutTheStatus) {
    Register a(8, addressBytes, 8, dataBytes, 5, 0x1F);
    Register b(8, addressBytes, 8, dataBytes, 5, 0);
    EXPECT_TRUE(a == b);
    for (const std::size_t index : {0U, 7U, 8U, 15U}) {
        (*b.getRegister())[index] ^= true;
        EXPECT_FALSE(a == b) << index;
        (*b.getRegister())[index] ^= true;
    }
    Register wider(8, addressBytes, 8, dataBytes, 3, 0);
    EXPECT_FALSE(a == wider);
    // Each side uses its own mask: the two bits that only the narrow one shows must meet zeros.
    Register narrow(8, addressBytes, 10, dataBytes, 3, 0);
    *narrow.getRegister() = *a.getRegister();
    EXPECT_FALSE(narrow == a);
    narrow.getRegister()->clearBit(16);
    narrow.getRegister()->clearBit(17);
    EXPECT_TRUE(narrow == a);
    // An assignment keeps the mask.
    Register unmasked(8, addressBytes, 8, dataBytes, 0, 0);
    Register source(8, addressBytes, 4, dataBytes, 4, 0xF);
    unmasked = source;
    EXPECT_EQ(unmasked.getStatus(), 15);
    source.setStatus(1);
    EXPECT_FALSE(unmasked == source) << "its mask hides nothing";
}

TEST(Register, PrintsItsPartsAndItsTotal) {
    Register reg(2, 3, 2);
    const RLBitVec data(3, true);
    testing::internal::CaptureStdout();
    reg.setData(&data);
    reg.registerDisplay();
    reg.display();
    EXPECT_EQ(testing::internal::GetCapturedStdout(),
              "Register: [\n  0 0 0 0 0 0 0 \n]\n\n"
              "Address: [\n  0 0 \n]\n\nData: [\n  1 1 1 \n]\n\n"
              "Status: [\n  0 0 \n]\n\nTotal Register[\n  0 0 1 1 1 0 0 \n]\n\n");
}

TEST(Register, PrintsItsWorkWhenTheVariableIsSet) {
    const EnvironmentVariable variable("TESSALREGISTERDUMPDATA", "off");
    Register a(1, 1, 1);
    Register b(1, 1, 1);
    testing::internal::CaptureStdout();
    a.setStatus(1);
    EXPECT_TRUE(a == b);
    EXPECT_EQ(testing::internal::GetCapturedStdout(),
              "status: [\n  1 \n]\n\n"
              "Operand1 data [\n  0 0 0 \n]\n\nMask [\n  0 1 1 \n]\n\n"
              "Operand2 data [\n  0 0 0 \n]\n\nMask [\n  0 1 1 \n]\n\n"
              "&[\n  0 0 0 \n]\n\n&[\n  0 0 0 \n]\n\nReCalculating ...\n[\n  1 0 0 \n]\n\n");
}

TEST(Register, WithoutVectorsAnswersWithNothing) {
    Register source(8, addressBytes, 8, dataBytes, 4, 3);
    Register empty(source);
    Register other;
    empty = source;
    empty.setStatus(3);
    empty.setAddress(nullptr);
    empty.updateData();
    EXPECT_EQ(empty.getRegisterSize() + empty.getStatus(), 0);
    EXPECT_TRUE(empty.getData() == nullptr && empty.getStatus(true) == nullptr);
    EXPECT_FALSE(empty == source || source == other);
    empty.display();
}

}  // namespace
