// The examples of docs/data-files.md hold.

#include <regex>
#include <sstream>

#include "AcdReader.h"
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
    const std::regex form("\\| `([^`]*)` \\| ([^ ]+), (-?[0-9]+), ([^ ]+), ([0-9]+) \\| (.*) \\|");
    std::istringstream lines(page());
    int count = 0;
    std::smatch row;
    for (std::string line; std::getline(lines, line);) {
        line.erase(line.find_last_not_of('\r') + 1);
        if (std::regex_match(line, row, form)) {
            writeFile(m_directory / "cells.acd", "[base]\nKEY = " + row[1].str() + "\n");
            const Told rowSeparator(row[2]);
            const Told fieldSeparator(row[4]);
            const auto table = openTable("cells.acd");
            EXPECT_STREQ(table->getstringbykey("KEY", rowSeparator.get(), static_cast<short>(std::stoi(row[3])),
                                               fieldSeparator.get(), static_cast<short>(std::stoi(row[5]))),
                         Told(row[6]).get())
                << line;
            ++count;
        }
    }
    EXPECT_EQ(count, 9);
}

}  // namespace
