// The examples of docs/data-files.md hold.

#include <sstream>

#include "AcdReader.h"
#include "DataFileModel.h"
#include "KeyedFiles.h"

namespace {

using Documentation = KeyedFiles;

std::string page() {
    return bytesOf(fs::u8path(TEST_DATA_DIR).parent_path().parent_path() / "docs" / "data-files.md");
}

TEST_F(Documentation, TheExampleFileReadsAsItLooks) {
    const std::string text = page();
    const std::size_t begin = text.find("```\n") + 4;
    writeFile(m_directory / "tessal.acd", text.substr(begin, text.find("```", begin) - begin));
    AcdReader reader;
    EXPECT_EQ(reader.getLongByKey("VERSION"), 3);
    ProfileKeyTable& table = *reader.getDevkey();
    EXPECT_STREQ(table.getstringbykey("COMMAND_FORMAT", ":", 1, ",", 2), "-p|-position");
    EXPECT_STREQ(table.getstringbykey("COMMAND_FORMAT", ":", 2, ",", 2), "");
    EXPECT_EQ(table.getstringbykey("COMMAND_FORMAT", ":", 3, ",", 0), nullptr);
    reader.setDevice("xz7s10");
    EXPECT_EQ(reader.getLongVectorByKey("SECTOR_ADDRESS"), (std::vector<std::int32_t>{0, 4096, 8192}));
    EXPECT_EQ(reader.getLongByKey("BIT0_ADDRESS"), 65536);
}

/// A text of the table of cells: `text`, null, or "empty" with its reason.
struct Told {
    explicit Told(const std::string& column)
        : text(column[0] == '`' ? column.substr(1, column.rfind('`') - 1) : ""), isNull(column.rfind("null", 0) == 0) {}
    const char* get() const { return isNull ? nullptr : text.c_str(); }

    std::string text;
    bool isNull;
};

TEST_F(Documentation, TheTableOfCellsHolds) {
    std::istringstream lines(page());
    int count = 0;
    for (std::string line; std::getline(lines, line);) {
        const std::vector<std::string> columns = modelSplit(line, " | ");
        const std::vector<std::string> lookup = modelSplit(columns.size() == 3 ? columns[1] : "", ", ");
        if (columns[0].rfind("| `", 0) != 0 || lookup.size() != 4) {
            continue;
        }
        writeFile(m_directory / "cells.acd", "[base]\nKEY = " + Told(columns[0].substr(2)).text + "\n");
        const Told rowSeparator(lookup[0]);
        const Told fieldSeparator(lookup[2]);
        const auto table = openTable("cells.acd");
        EXPECT_STREQ(table->getstringbykey("KEY", rowSeparator.get(), static_cast<short>(std::stoi(lookup[1])),
                                           fieldSeparator.get(), static_cast<short>(std::stoi(lookup[3]))),
                     Told(columns[2]).get())
            << line;
        ++count;
    }
    EXPECT_EQ(count, 9);
}

}  // namespace
