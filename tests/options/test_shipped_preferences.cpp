// The shipped preference table and the enumerators that name its rows.

#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include <algorithm>
#include <string>

#include "DataPath.h"
#include "Preference.h"

namespace {

#define TESSAL_NAME(name) #name,
constexpr const char* enumerators[] = {TESSAL_PREFERENCES(TESSAL_NAME)};
#undef TESSAL_NAME

TEST(ShippedPreferences, EveryEnumeratorIsTheRowOfItsName) {
    DeviceProfile::setDataPath(SHIPPED_DATA_DIR);
    TessalPreference& preferences = *TessalPreference::getPreferenceObject();
    int row = 0;
    for (std::string name : enumerators) {
        name.erase(std::remove(name.begin(), name.end(), '_'), name.end());
        const auto preference = TessalPreference::PREFERENCE(row++);
        EXPECT_THAT(TessalPreference::pref2String(preference), testing::StrCaseEq(name));
        EXPECT_STRNE(preferences.getPreference(preference), "") << name;
    }
    EXPECT_STREQ(preferences.getPreference(TessalPreference::PREFERENCE(row)), "") << "one row too many";
}

}  // namespace
