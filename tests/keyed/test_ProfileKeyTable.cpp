#include <climits>
#include <utility>

#include "DataFileModel.h"
#include "KeyedFiles.h"
#include "MessageRecorder.h"

namespace {

using KeyTable = KeyedFiles;

TEST_F(KeyTable, FindsCellsAsTheModelDoes) {
    constexpr const char* no = nullptr;
    constexpr std::pair<const char*, const char*> separatorPairs[] = {{":", ","}, {",", ":"}, {",", ","}, {":", no},
                                                                      {no, ","},  {no, no},   {"", ""},   {"::", no}};
    constexpr short indexes[] = {SHRT_MIN, -1, 0, 1, 2, 3, 4, SHRT_MAX};
    const std::string bytes = "[base]\nW = one\nTAB = a,b:c,,d:,:e\nE =\nL = x::y:z::\n";
    m_directory.write("cells.acd", bytes);
    const auto table = openTable("cells.acd");
    for (const auto& [key, value] : modelSection(bytes, "base")) {
        for (const auto& [rows, fields] : separatorPairs) {
            for (const short row : indexes) {
                for (const short field : indexes) {
                    const auto expected = modelCell(value, rows, row, fields, field);
                    const char* const cell = table->getstringbykey(key.c_str(), rows, row, fields, field);
                    EXPECT_STREQ(cell, expected ? expected->c_str() : nullptr) << key << " " << row << " " << field;
                }
            }
        }
    }
    for (const char* const absent : {"w", "TA", "", no}) {
        EXPECT_EQ(table->getstringbykey(absent, ":", 0, ",", 0), nullptr);
    }
}

TEST_F(KeyTable, ReadsBaseWithoutASelectionAndItsTextsLiveAsLongAsItDoes) {
    m_directory.write("lasting.acd", "[base]\nA = 1,2\nB = 3,4\n[xz1]\nA = 5\n");
    ProfileKeyTable table("lasting.acd", nullptr, 1, 1, 1);
    const char* const field = table.getstringbykey("A", ",", 1, nullptr, 0);
    const char* const whole = valueOf(table, "A");
    for (const char* const separator : {",", ";", "1", "2", "A"}) {
        table.getstringbykey("B", separator, 0, nullptr, 0);
        table.getstringbykey("A", separator, 0, nullptr, 0);
    }
    EXPECT_STREQ(field, "2");
    EXPECT_STREQ(whole, "1,2");
}

TEST_F(KeyTable, FindsManyKeysAndTheLastValueOfEach) {
    std::string bytes = "[base]\n";
    for (int i = 0; i < 6000; ++i) {
        bytes += "KEY_" + std::to_string(i % 4000) + " = x:" + std::to_string(i) + "\n";
    }
    m_directory.write("many.acd", bytes);
    const MessageRecorder messages;  // keys that are set twice
    const auto table = openTable("many.acd");
    for (int i = 0; i < 4000; ++i) {
        const std::string key = "KEY_" + std::to_string(i);
        ASSERT_EQ(table->GetInt32ByKey(key.c_str(), ":", 1, nullptr, 0), i < 2000 ? i + 4000 : i) << key;
    }
}

TEST_F(KeyTable, FlagsSilenceTheMessages) {
    m_directory.write("faults.acd", "[base]\nA = 1\nA = 2\nx\n");
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
