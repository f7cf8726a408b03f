#include <climits>
#include <tuple>

#include "KeyedFiles.h"
#include "MessageRecorder.h"

namespace {

using KeyTable = KeyedFiles;

TEST_F(KeyTable, FindsCellsBySeparatorsAndIndexes) {
    m_directory.write("cells.acd", "[base]\nW = one\nTAB = a,b:c,,d:,:e\nE =\nL = x::y:z::\n");
    constexpr const char* no = nullptr;
    // A key, the separator and index of the row and of the field, the cell or null.
    const std::tuple<const char*, const char*, short, const char*, short, const char*> cases[] = {
        {"TAB", ":", 1, ",", 2, "d"},  {"TAB", ":", 1, ",", 1, ""},  {"TAB", ":", 2, ",", 1, ""},
        {"TAB", ":", 3, ",", 0, "e"},  {"TAB", ":", 0, ",", 2, no},  {"TAB", ":", 4, ",", 0, no},
        {"TAB", ":", -1, ",", 0, no},  {"TAB", ":", 0, ",", -1, no}, {"TAB", ":", 1, no, 0, "c,,d"},
        {"TAB", ":", 1, no, 1, no},    {"TAB", no, 1, no, 0, no},    {"TAB", no, 0, no, 1, no},
        {"TAB", no, 0, ",", 1, "b:c"}, {"TAB", ",", 1, ":", 1, "c"}, {"TAB", ",", 1, ",", 0, "b:c"},
        {"L", "::", 1, no, 0, "y:z"},  {"L", "::", 2, no, 0, ""},    {"W", ":", 0, ",", 0, "one"},
        {"E", ",", 0, no, 0, ""},      {"E", ",", 1, no, 0, no},     {"NONE", no, 0, no, 0, no},
        {"w", no, 0, no, 0, no},       {"TA", ":", 0, ",", 0, no},   {"", no, 0, no, 0, no},
        {no, ":", 0, ",", 0, no},      {"W", "", 0, "", 0, "one"},   {"W", no, 0, no, 0, "one"},
    };
    const auto table = openTable("cells.acd");
    int number = 0;
    for (const auto& [key, rowSeparator, row, fieldSeparator, field, cell] : cases) {
        EXPECT_STREQ(table->getstringbykey(key, rowSeparator, row, fieldSeparator, field), cell) << "case " << number;
        ++number;
    }
    for (const short extreme : {short{SHRT_MIN}, short{SHRT_MAX}}) {
        EXPECT_EQ(table->getstringbykey("TAB", ":", extreme, ",", extreme), nullptr);
    }
}

TEST_F(KeyTable, TextsLiveAsLongAsTheTable) {
    m_directory.write("lasting.acd", "[base]\nA = 1,2\nB = 3,4\n");
    const auto table = openTable("lasting.acd");
    const char* const field = table->getstringbykey("A", ",", 1, nullptr, 0);
    const char* const whole = valueOf(*table, "A");
    for (const char* const separator : {",", ";", "1", "2", "A"}) {
        table->getstringbykey("B", separator, 0, nullptr, 0);
        table->getstringbykey("A", separator, 0, nullptr, 0);
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

TEST_F(KeyTable, NeedsTheSelectionOnlyWhileItOpensAndTakesBaseWithoutOne) {
    m_directory.write("profiles.acd", "[base]\nA = base\n[xz1]\nA = device\n");
    EXPECT_STREQ(valueOf(*openTable("profiles.acd", "xz1"), "A"), "device");
    ProfileKeyTable unselected("profiles.acd", nullptr, 1, 1, 1);
    EXPECT_STREQ(valueOf(unselected, "A"), "base");
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
