// The pictures of docs/bits.md are drawn from docs/pictures/bits.csv, which must tell what the library does.
#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include <fstream>
#include <iterator>
#include <sstream>

#include "BitView.h"
#include "Hex2Bit.h"
#include "bits/Model.h"

namespace {

/// A number for each index, with blanks between.
template <class Number>
std::string ofEachIndex(std::size_t length, Number number) {
    std::string text;
    for (std::size_t i = 0; i < length; ++i) {
        text += (i > 0 ? " " : "") + std::to_string(number(i));
    }
    return text;
}

/// The storage position of each index of a vector, found by setting the bit.
std::string positionsOf(std::size_t length, Numbering numbering) {
    return ofEachIndex(length, [=](std::size_t i) {
        NumberedVec vector(length, numbering);
        numbering == Numbering::Storage ? vector.LRBitVec::setBit(i) : vector.setBit(i);
        return LRBitVec(vector.data(), (length + 7) / 8 * 8).firstTrue();
    });
}

TEST(BitsGuide, PicturesShowWhatTheLibraryDoes) {
    std::ostringstream table;
    table << std::boolalpha << "what,of,values\n"
          << "index,LRBitVec," << positionsOf(12, Numbering::Storage) << "\nindex,RLBitVec,"
          << positionsOf(12, Numbering::Usual) << "\nindex,RLBitVec forward," << positionsOf(12, Numbering::Forward)
          << "\nindex,RLBitVec byte mirror," << positionsOf(12, Numbering::Mirrored) << "\n";
    for (int form = 0; form < 4; ++form) {
        const bool descending = form / 2 != 0;
        const bool byteSwap = form % 2 != 0;
        const auto load = [=](const char* text) {
            return Hex2Bit::convertHexString2BitVec(text, 16, descending, byteSwap, false);
        };
        const auto row = [&](const char* what, const std::string& values) {
            table << what << ",12a5 descending " << descending << " byteSwap " << byteSwap << "," << values << "\n";
        };
        const auto vector = load("12a5");
        // The ones of two more loads spell, in binary, the place in the text that a bit comes from.
        const auto high = load("00ff");
        const auto low = load("0f0f");
        row("bit", ofEachIndex(16, [&](std::size_t i) { return vector->testBit(i); }));
        row("character", ofEachIndex(16, [&](std::size_t i) { return 2 * high->testBit(i) + low->testBit(i); }));
        row("position", positionsOf(16, Numbering::Usual));
        row("data", hexDump(*vector).substr(10, 5));
    }
    std::ifstream file(TEST_DATA_DIR "/../../docs/pictures/bits.csv");
    EXPECT_THAT(std::string(std::istreambuf_iterator<char>(file), {}), testing::StrCaseEq(table.str()));
}

}  // namespace
