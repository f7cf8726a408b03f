// The tables and pictures of docs/bits.md say what the library does.
#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include <algorithm>
#include <fstream>
#include <iterator>
#include <memory>
#include <sstream>
#include <string>
#include <vector>

#include "Hex2Bit.h"

namespace {

using Cells = std::vector<std::string>;

/// The rows of the guide's tables that have so many cells and begin with an example.
std::vector<Cells> rowsOf(std::size_t cellCount) {
    std::ifstream guide(TEST_DATA_DIR "/../../docs/bits.md");
    std::vector<Cells> rows;
    for (std::string line; std::getline(guide, line);) {
        Cells cells;
        std::istringstream row(line.rfind("| `", 0) == 0 ? line.substr(2) : "");
        for (std::string cell; std::getline(row, cell, '|');) {
            const std::size_t end = cell.find_last_not_of(" \r");
            cell = cell.substr(cell[0] == ' ' ? 1 : 0, end + (cell[0] == ' ' ? 0 : 1));
            const bool isQuoted = cell.size() > 1 && cell.front() == '`' && cell.back() == '`';
            cells.push_back(isQuoted ? cell.substr(1, cell.size() - 2) : cell);
        }
        if (!cells.empty() && cells.back().empty()) {
            cells.pop_back();
        }
        if (cells.size() == cellCount) {
            rows.push_back(cells);
        }
    }
    return rows;
}

std::string bytesOf(const RLBitVec& vector) {
    std::ostringstream text;
    for (std::size_t i = 0; i < vector.getNumberBytes(); ++i) {
        text << (i > 0 ? " " : "") << "0123456789ABCDEF"[vector.data()[i] >> 4]
             << "0123456789ABCDEF"[vector.data()[i] & 15];
    }
    return text.str();
}

TEST(BitsGuide, LoadsBecomeWhatTheTableSays) {
    const auto rows = rowsOf(7);
    ASSERT_THAT(rows, testing::SizeIs(10));
    for (const Cells& row : rows) {
        RLBitVec vector(std::stoul(row[1]));
        Hex2Bit::convertHexString2BitVec(&vector, row[0].c_str(), std::stoi(row[2]), row[3] == "true", row[4] == "true",
                                         false);
        std::string indexes;
        for (std::size_t i = 0; i < vector.length(); ++i) {
            indexes.push_back(vector.testBit(i) ? '1' : '0');
        }
        EXPECT_EQ(indexes, row[5]) << testing::PrintToString(row);
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

struct Forward : RLBitVec {
    explicit Forward(std::size_t length) : RLBitVec(length) { m_forwardIndex = 1; }
};
struct ByteMirror : RLBitVec {
    explicit ByteMirror(std::size_t length) : RLBitVec(length) { m_byteMirrorIndex = 1; }
};

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
template <class Vector>
std::string positionsOf(std::size_t length) {
    return ofEachIndex(length, [=](std::size_t i) {
        Vector vector(length);
        vector.setBit(i);
        return LRBitVec(vector.data(), (length + 7) / 8 * 8).firstTrue();
    });
}

/// The place in the text of the digit that index @p i of a load comes from: the one whose ones arrive there.
std::size_t sourceOf(std::size_t i, std::size_t digits, bool descending, bool byteSwap) {
    for (std::size_t place = 0; place < digits; ++place) {
        std::string text(digits, '0');
        text[place] = 'f';
        const auto vector =
            Hex2Bit::convertHexString2BitVec(text.c_str(), static_cast<int>(4 * digits), descending, byteSwap, false);
        if (vector->testBit(i)) {
            return place;
        }
    }
    return digits;
}

TEST(BitsGuide, PicturesShowWhatTheLibraryDoes) {
    std::ostringstream table;
    table << "what,of,values\n"
          << "index,LRBitVec," << positionsOf<LRBitVec>(12) << "\nindex,RLBitVec," << positionsOf<RLBitVec>(12)
          << "\nindex,RLBitVec forward," << positionsOf<Forward>(12) << "\nindex,RLBitVec byte mirror,"
          << positionsOf<ByteMirror>(12) << "\n";
    const std::string positions = positionsOf<RLBitVec>(16);
    for (const bool descending : {false, true}) {
        for (const bool byteSwap : {false, true}) {
            std::ostringstream load;
            load << std::boolalpha << ",12a5 descending " << descending << " byteSwap " << byteSwap << ",";
            const auto vector = Hex2Bit::convertHexString2BitVec("12a5", 16, descending, byteSwap, false);
            const auto bit = [&](std::size_t i) { return vector->testBit(i) ? 1 : 0; };
            const auto source = [&](std::size_t i) { return sourceOf(i, 4, descending, byteSwap); };
            table << "bit" << load.str() << ofEachIndex(16, bit) << "\ncharacter" << load.str()
                  << ofEachIndex(16, source) << "\nposition" << load.str() << positions << "\ndata" << load.str()
                  << bytesOf(*vector) << "\n";
        }
    }
    std::ifstream file(TEST_DATA_DIR "/../../docs/pictures/bits.csv");
    const std::string drawn((std::istreambuf_iterator<char>(file)), std::istreambuf_iterator<char>());
    EXPECT_EQ(drawn, table.str());
}

}  // namespace
