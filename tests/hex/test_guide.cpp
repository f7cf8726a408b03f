// The tables and pictures of docs/bits.md say what the library does.
#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include <algorithm>
#include <fstream>
#include <iterator>
#include <regex>
#include <sstream>

#include "BitView.h"
#include "Hex2Bit.h"
#include "hex/HexModel.h"

namespace {

using Cells = std::vector<std::string>;

/// The cells, without the blanks and back quotes around them, of the guide's table rows that begin with an example and
/// have so many.
std::vector<Cells> rowsOf(std::size_t cellCount) {
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

std::string bytesOf(const RLBitVec& vector) {
    std::string text;
    for (std::size_t i = 0; i < vector.getNumberBytes(); ++i) {
        char byte[4];
        std::snprintf(byte, sizeof byte, " %02X", vector.data()[i]);
        text += byte;
    }
    return text.substr(1);
}

TEST(BitsGuide, LoadsBecomeWhatTheTableSays) {
    const auto rows = rowsOf(7);
    ASSERT_THAT(rows, testing::SizeIs(10));
    for (const Cells& row : rows) {
        RLBitVec vector(std::stoul(row[1]));
        Hex2Bit::convertHexString2BitVec(&vector, row[0].c_str(), std::stoi(row[2]), row[3] == "true", row[4] == "true",
                                         false);
        EXPECT_EQ(toGroupedText(vector, 0), row[5]) << testing::PrintToString(row);
        EXPECT_EQ(bytesOf(vector), row[6]) << testing::PrintToString(row);
    }
}

TEST(BitsGuide, TextsBecomeWhatTheTableSays) {
    const auto rows = rowsOf(5);
    ASSERT_THAT(rows, testing::SizeIs(6));
    for (const Cells& row : rows) {
        std::string digits = row[0];
        digits.erase(std::remove(digits.begin(), digits.end(), ' '), digits.end());
        const auto bytes =
            Hex2Bit::convertHexString2BinData(digits.c_str(), static_cast<int>(4 * digits.size()), true, true);
        const std::unique_ptr<char[]> text(
            Hex2Bit::convertBinData2HexString(bytes.get(), std::stoi(row[1]), row[2] == "true", row[3] == "true"));
        EXPECT_EQ(text.get(), row[4]) << testing::PrintToString(row);
    }
}

/// One thing of each index, with blanks between.
template <class Thing>
std::string ofEachIndex(std::size_t length, Thing thing) {
    std::string text;
    for (std::size_t i = 0; i < length; ++i) {
        text += (i > 0 ? " " : "") + std::to_string(thing(i));
    }
    return text;
}

/// The storage position of each index of a vector, found by setting the bit.
std::string positionsOf(std::size_t length, Numbering numbering) {
    return ofEachIndex(length, [=](std::size_t i) {
        HexModel::NumberedVec vector(length, numbering);
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
        const auto vector = load("12a5");
        const auto bit = [&](std::size_t i) { return vector->testBit(i) ? 1 : 0; };
        // The ones of two more loads spell, in binary, the place in the text that a bit comes from.
        const auto high = load("00ff");
        const auto low = load("0f0f");
        const auto source = [&](std::size_t i) { return (high->testBit(i) ? 2 : 0) + (low->testBit(i) ? 1 : 0); };
        const auto row = [&](const char* what, const std::string& values) {
            table << what << ",12a5 descending " << descending << " byteSwap " << byteSwap << "," << values << "\n";
        };
        row("bit", ofEachIndex(16, bit));
        row("character", ofEachIndex(16, source));
        row("position", positionsOf(16, Numbering::Usual));
        row("data", bytesOf(*vector));
    }
    std::ifstream file(TEST_DATA_DIR "/../../docs/pictures/bits.csv");
    const std::string drawn((std::istreambuf_iterator<char>(file)), std::istreambuf_iterator<char>());
    EXPECT_EQ(drawn, table.str());
}

}  // namespace
