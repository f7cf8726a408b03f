// The preference table over tests/data/preferences. The table lives as long as the process, so every case puts back
// what it changed, and only the first case may look at it before it is loaded.

#include "Preference.h"

#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include "DataPath.h"
#include "MessageRecorder.h"
#include "TessalException.h"

namespace {

using testing::_;
using testing::ElementsAre;
using testing::IsEmpty;
using Row = TessalPreference::PREFERENCE;

constexpr Row automatic = Row(0), level = Row(1), alone = Row(2), single = Row(3), mixed = Row(4);

TessalPreference& loaded() {
    DeviceProfile::setDataPath(TEST_DATA_DIR "/preferences");
    return *TessalPreference::getPreferenceObject();
}

TEST(Preference, TheTableIsThatOfTheDataFile) {
    TessalPreference& preferences = loaded();
    const MessageRecorder messages;
    TessalPreference::dump();
    EXPECT_THAT(messages.status(), ElementsAre("Preference Table\n", "Name                 Setting             \n", _,
                                               "Level                1                   \n", _, _,
                                               "Mixed                aB                  \n"));
    EXPECT_TRUE(preferences.isPreferenceTrue(automatic));
    EXPECT_EQ(preferences.getPreferenceValue(level), 1);
    EXPECT_EQ(preferences.getPreferenceValue(automatic), 0);
    EXPECT_STREQ(TessalPreference::pref2String(mixed), "Mixed");
    EXPECT_STREQ(TessalPreference::pref2String(alone), "");
    EXPECT_EQ(TessalPreference::string2Pref("LEVEL"), level);
}

TEST(Preference, SettingStoresUpperCaseAndRefusesTheRest) {
    TessalPreference& preferences = loaded();
    const MessageRecorder messages;
    EXPECT_TRUE(preferences.setPreference(automatic, false));
    EXPECT_STREQ(preferences.getPreference(automatic), "FALSE");
    EXPECT_FALSE(preferences.isPreferenceTrue(automatic));
    EXPECT_TRUE(preferences.setPreference(level, 3));
    EXPECT_FALSE(preferences.setPreference(level, 4));
    EXPECT_EQ(preferences.getPreferenceValue(level), 3);
    EXPECT_TRUE(preferences.setPreference(mixed, "cd"));
    EXPECT_STREQ(preferences.getPreference(mixed), "CD");
    EXPECT_FALSE(preferences.setPreference(single, true) || preferences.setPreference(alone, "") ||
                 preferences.setPreference(mixed, static_cast<const char*>(nullptr)) ||
                 TessalPrefOption().setValue(nullptr));
    EXPECT_THAT(
        messages.info(),
        ElementsAre("4 is not a legal preference value for Level.\n",
                    "TRUE is not a legal preference value for Single.\n", " is not a legal preference value for .\n",
                    " is not a legal preference value for Mixed.\n", " is not a legal preference value for .\n"));
    TessalPreference::removePreferenceObject();
    TessalPreference& again = *TessalPreference::getPreferenceObject();
    EXPECT_EQ(again.getPreferenceValue(level), 3) << "the table outlives the object";
    EXPECT_TRUE(again.setPreference(automatic, "true") && again.setPreference(level, "1") &&
                again.setPreference(mixed, "ab"));
}

TEST(Preference, RowsAndNamesOutsideTheTable) {
    TessalPreference& preferences = loaded();
    MessageRecorder messages;
    for (const Row row : {Row(5), Row(-1)}) {
        EXPECT_STREQ(preferences.getPreference(row), "");
        EXPECT_TRUE(!preferences.isPreferenceTrue(row) && preferences.getPreferenceValue(row) == 0);
        EXPECT_THROW(TessalPreference::pref2String(row), DataNotFoundException);
    }
    EXPECT_THAT(messages.all(), IsEmpty());
    EXPECT_FALSE(preferences.setPreference(Row(5), "x"));
    for (const char* name : {"nosuch", "Alone"}) {
        EXPECT_THROW(TessalPreference::string2Pref(name), DataNotFoundException);
    }
    EXPECT_EQ(TessalPreference::string2Pref(nullptr), alone) << "the row without a name";
    EXPECT_THAT(messages.info(),
                ElementsAre("Preference 5 is not defined. Check data file tessal.acd.\n",
                            "nosuch is not in Preference Table.\n", "Alone is not in Preference Table.\n"));
}

}  // namespace
