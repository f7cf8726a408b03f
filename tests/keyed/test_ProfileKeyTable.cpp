#include <climits>
#include <random>

#include "DataFileModel.h"
#include "KeyedFiles.h"
#include "MessageRecorder.h"

namespace {

using KeyTable = KeyedFiles;

TEST_F(KeyTable, FindsCellsBySeparatorsAndIndexes) {
    writeFile(m_directory / "cells.acd", "[base]\nWORD = one\nTABLE = a,b:c,,d:,:e\nEMPTY =\nLONG = x::y:z::\n");
    struct Case {
        const char* name;
        const char* key;
        const char* rowSeparator;
        short row;
        const char* fieldSeparator;
        short field;
        const char* cell;
    };
    const Case cases[] = {
        {"whole value", "TABLE", nullptr, 0, nullptr, 0, "a,b:c,,d:,:e"},
        {"whole value by empty separators", "TABLE", "", 0, "", 0, "a,b:c,,d:,:e"},
        {"second row of a whole value", "TABLE", nullptr, 1, nullptr, 0, nullptr},
        {"second field of a whole value", "TABLE", nullptr, 0, nullptr, 1, nullptr},
        {"cell", "TABLE", ":", 1, ",", 2, "d"},
        {"empty middle field", "TABLE", ":", 1, ",", 1, ""},
        {"last empty field", "TABLE", ":", 2, ",", 1, ""},
        {"field past the row's end", "TABLE", ":", 0, ",", 2, nullptr},
        {"last row", "TABLE", ":", 3, ",", 0, "e"},
        {"row past the end", "TABLE", ":", 4, ",", 0, nullptr},
        {"whole row", "TABLE", ":", 1, nullptr, 0, "c,,d"},
        {"second field of a whole row", "TABLE", ":", 1, nullptr, 1, nullptr},
        {"fields of the one row", "TABLE", nullptr, 0, ",", 1, "b:c"},
        {"other separators on the same key", "TABLE", ",", 1, ":", 1, "c"},
        {"negative row", "TABLE", ":", -1, ",", 0, nullptr},
        {"negative field", "TABLE", ":", 0, ",", -1, nullptr},
        {"lowest indexes", "TABLE", ":", SHRT_MIN, ",", SHRT_MIN, nullptr},
        {"highest indexes", "TABLE", ":", SHRT_MAX, ",", SHRT_MAX, nullptr},
        {"no separator in the value", "WORD", ":", 0, ",", 0, "one"},
        {"empty value", "EMPTY", ",", 0, nullptr, 0, ""},
        {"past an empty value", "EMPTY", ",", 1, nullptr, 0, nullptr},
        {"separator of two characters", "LONG", "::", 1, nullptr, 0, "y:z"},
        {"behind the last separator", "LONG", "::", 2, nullptr, 0, ""},
        {"equal separators", "TABLE", ",", 1, ",", 0, "b:c"},
        {"absent key", "NONE", nullptr, 0, nullptr, 0, nullptr},
        {"key in another case", "word", nullptr, 0, nullptr, 0, nullptr},
        {"start of a key", "WOR", ":", 0, ",", 0, nullptr},
        {"empty key", "", nullptr, 0, nullptr, 0, nullptr},
        {"null key", nullptr, ":", 0, ",", 0, nullptr},
    };
    const auto table = openTable("cells.acd");
    for (const Case& row : cases) {
        EXPECT_STREQ(table->getstringbykey(row.key, row.rowSeparator, row.row, row.fieldSeparator, row.field), row.cell)
            << row.name;
    }
}

TEST_F(KeyTable, TextsLiveAsLongAsTheTable) {
    writeFile(m_directory / "lasting.acd", "[base]\nA = 1,2\nB = 3,4\n");
    const auto table = openTable("lasting.acd");
    const char* const field = table->getstringbykey("A", ",", 1, nullptr, 0);
    const char* const whole = table->getstringbykey("A", nullptr, 0, nullptr, 0);
    for (const char* const separator : {",", ";", "1", "2", "A"}) {
        table->getstringbykey("B", separator, 0, nullptr, 0);
        table->getstringbykey("A", separator, 0, nullptr, 0);
    }
    EXPECT_STREQ(field, "2");
    EXPECT_STREQ(whole, "1,2");
}

TEST_F(KeyTable, ReadsNumbersAndGivesZeroWhereThereIsNone) {
    writeFile(m_directory / "numbers.acd", "[base]\nN = 12, -7,x,,99999999999,5k\n");
    const auto table = openTable("numbers.acd");
    const int expected[] = {12, -7, 0, 0, INT_MAX, 5, 0};
    for (short i = 0; i < 7; ++i) {
        EXPECT_EQ(table->GetInt32ByKey("N", ",", i, nullptr, 0), expected[i]) << i;
    }
    EXPECT_EQ(table->GetInt32ByKey("NONE", nullptr, 0, nullptr, 0), 0);
}

TEST_F(KeyTable, IndexesUpToTheHighestRow) {
    std::string rows = "[base]\nT = 0";
    for (int i = 1; i < 40000; ++i) {
        rows += ":" + std::to_string(i);
    }
    writeFile(m_directory / "rows.acd", rows);
    const auto table = openTable("rows.acd");
    EXPECT_STREQ(table->getstringbykey("T", ":", SHRT_MAX, ",", 0), "32767");
}

TEST_F(KeyTable, ManyKeysInterleavedAnswerAsTheModelDoes) {
    std::mt19937 random(7);
    std::string bytes = "[base]\n";
    for (int i = 0; i < 3000; ++i) {
        bytes += "KEY_" + std::to_string(random() % 2000) + " = ";
        for (auto length = random() % 12; length != 0; --length) {
            bytes += "ab,:"[random() % 4];
        }
        bytes += "\n";
    }
    writeFile(m_directory / "many.acd", bytes);
    const ModelSection model = modelSection(bytes, "base");
    const MessageRecorder messages;  // keys that are set twice
    const auto table = openTable("many.acd");
    for (int i = 0; i < 20000; ++i) {
        const std::string key = "KEY_" + std::to_string(random() % 2000);
        const auto found = model.find(key);
        const int row = static_cast<int>(random() % 4);
        const int field = static_cast<int>(random() % 4);
        const char* const separators = i % 2 == 0 ? ":," : ",:";
        const std::string rowSeparator(1, separators[0]);
        const std::string fieldSeparator(1, separators[1]);
        const auto expected =
            found == model.end() ? std::nullopt : modelCell(found->second, rowSeparator, row, fieldSeparator, field);
        ASSERT_STREQ(table->getstringbykey(key.c_str(), rowSeparator.c_str(), static_cast<short>(row),
                                           fieldSeparator.c_str(), static_cast<short>(field)),
                     expected ? expected->c_str() : nullptr)
            << key << " " << row << " " << field;
    }
}

TEST_F(KeyTable, NeedsTheSelectionOnlyWhileItOpensAndTakesBaseWithoutOne) {
    writeFile(m_directory / "profiles.acd", "[base]\nA = base\n[xz1]\nA = device\n");
    auto config =
        std::make_unique<DeviceProfile::ProfileConfig>("xz1", static_cast<unsigned char>(1), ProfilePartUnbound);
    constexpr unsigned char on = 1;
    ProfileKeyTable device("profiles.acd", config.get(), on, on, on);
    config.reset();
    EXPECT_STREQ(device.getstringbykey("A", nullptr, 0, nullptr, 0), "device");
    ProfileKeyTable unselected("profiles.acd", nullptr, on, on, on);
    EXPECT_STREQ(unselected.getstringbykey("A", nullptr, 0, nullptr, 0), "base");
}

TEST_F(KeyTable, FlagsSilenceTheMessages) {
    writeFile(m_directory / "faults.acd", "[base]\nA = 1\nA = 2\nx\n");
    DeviceProfile::ProfileConfig base("base", 1, ProfilePartBound);
    MessageRecorder messages;
    for (int flags = 0; flags < 8; ++flags) {
        const auto flag = [flags](int bit) { return static_cast<unsigned char>(flags >> bit & 1); };
        messages.clear();
        const ProfileKeyTable faulty("faults.acd", &base, flag(0), flag(1), flag(2));
        EXPECT_EQ(messages.info().size(), static_cast<std::size_t>(flag(1) + flag(2)));
        messages.clear();
        const ProfileKeyTable absent("absent.acd", &base, flag(0), flag(1), flag(2));
        EXPECT_EQ(messages.info().size(), static_cast<std::size_t>(flag(0)));
    }
}

}  // namespace
