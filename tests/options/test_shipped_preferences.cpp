// The shipped preference table and the enumerators that name its rows.

#include <gtest/gtest.h>

#include <algorithm>
#include <string>

#include "DataPath.h"
#include "HkStr.h"
#include "Preference.h"

namespace {

std::string withoutUnderscores(std::string name) {
    name.erase(std::remove(name.begin(), name.end(), '_'), name.end());
    return name;
}

TEST(ShippedPreferences, EveryEnumeratorIsTheRowOfItsName) {
    DeviceProfile::setDataPath(SHIPPED_DATA_DIR);
    TessalPreference& preferences = *TessalPreference::getPreferenceObject();
    int row = 0;
#define TESSAL_CHECK(name)                                                                                            \
    EXPECT_EQ(static_cast<int>(TessalPreference::name), row);                                                         \
    EXPECT_EQ(                                                                                                        \
        HkStr::ICompare(TessalPreference::pref2String(TessalPreference::name), withoutUnderscores(#name).c_str()), 0) \
        << #name;                                                                                                     \
    EXPECT_STRNE(preferences.getPreference(TessalPreference::name), "");                                              \
    ++row;
    TESSAL_PREFERENCES(TESSAL_CHECK)
#undef TESSAL_CHECK
    EXPECT_STREQ(preferences.getPreference(static_cast<TessalPreference::PREFERENCE>(row)), "") << "one row too many";
}

}  // namespace
