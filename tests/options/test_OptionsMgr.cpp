#include "OptionsMgr.h"

#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include <limits>
#include <string>
#include <vector>

#include "MessageRecorder.h"

namespace {

using testing::ElementsAre;
using testing::IsEmpty;

/// A manager over a table of the test's own.
class TestOptions : public U_OptionsMgr {
public:
    explicit TestOptions(const std::vector<U_AttributePair>& attributes) : m_attributes(attributes) {
        init_options(attributes);
    }
    HkString getNumberOfOptionsText() override { return "NumberOfTestOptions"; }

    bool set(int row, const char* text) { return setOption(m_attributes, row, HkString(text)); }
    bool set(int row, bool on) { return setOption(m_attributes, row, on); }
    std::vector<std::string> texts(int first, int last) const {
        const std::vector<HkString> found = getOptions(m_attributes, first, last);
        return {found.begin(), found.end()};
    }

private:
    std::vector<U_AttributePair> m_attributes;
};

U_AttributePair flag(const char* dashValue, int groupSize = 0) {
    return {"KEY", true, dashValue, groupSize, true};
}

U_AttributePair text(const char* dashValue) {
    return {"KEY", false, dashValue, 0, true};
}

TEST(OptionsMgr, RowsGiveDashValueAndTextAndAGroupOneText) {
    TestOptions options({flag("-e"), text("-u"), text(""), flag(""), flag("-n", -3), flag("0", 2), flag("rp"),
                         text("code:"), flag("-x")});
    options.set(6, true);
    options.set(7, "1 2");
    EXPECT_THAT(options.texts(0, 9), IsEmpty()) << "members count only behind a leader that is on";
    for (int row : {8, 5, 4, 3, 0}) {
        EXPECT_TRUE(options.set(row, true));
    }
    EXPECT_TRUE(options.set(1, "a \"b\" c") && options.set(2, "never seen"));
    EXPECT_THAT(options.texts(0, 9), ElementsAre("-e", "-u", "a \"b\" c", "", "-n", "0 rp code:1 2", "-x"));
    EXPECT_THAT(options.texts(5, 6), ElementsAre("0 rp code:1 2")) << "a group is read past the range";
    options.clearOptions(6, 100);
    EXPECT_THAT(options.texts(4, 9), ElementsAre("-n", "0"));
}

TEST(OptionsMgr, RowsAndRangesOutsideTheTableAreRefused) {
    constexpr int most = std::numeric_limits<int>::max();
    constexpr int least = std::numeric_limits<int>::min();
    TestOptions options({flag("-a", most), text("-b")});
    EXPECT_TRUE(options.set(0, true) && options.set(1, "x"));
    for (int row : {-1, 2, least, most}) {
        SCOPED_TRACE(row);
        EXPECT_FALSE(options.set(row, true) || options.set(row, "x") || options.setOption(row, "x", true, true));
        EXPECT_FALSE(options.getOption(row) || options.isOptionSet(row) || options.isOptionBool(row));
        EXPECT_TRUE(options.getOptionString(row).IsEmpty());
    }
    EXPECT_THAT(options.texts(least, most), ElementsAre("-a -bx"));
    options.clearOptions(1, 1);
    options.clearOptions(most, least);
    EXPECT_STREQ(options.getOptionString(1), "x");
    EXPECT_THAT(TestOptions({}).getOptions({flag("-a")}, 0, 1), IsEmpty()) << "more descriptions than rows";
}

TEST(OptionsMgr, KindsAreCheckedAgainstTheDescriptionAlone) {
    TestOptions options({flag("-a"), text("-b")});
    EXPECT_FALSE(options.set(0, "x") || options.set(1, true));
    options.set(1, "x");
    EXPECT_FALSE(options.getOption(1) || options.isOptionSet(1));
    EXPECT_TRUE(options.setOption(1, "ignored", true, true)) << "the unchecked writer changes the kind";
    EXPECT_TRUE(options.isOptionSet(1));
    EXPECT_THAT(options.texts(0, 2), IsEmpty()) << "the description still says text";
    options.clearAllOptions();
    EXPECT_TRUE(options.isOptionBool(1)) << "clearing keeps the kind";
    EXPECT_TRUE(options.set(1, "y") && !options.isOptionBool(1));
}

TEST(OptionsMgr, FurtherRowsStandBehindAndAreShown) {
    TestOptions options({flag("-a")});
    options.set(0, true);
    options.init_options({text("x%s")});
    options.addOption({"added%s", false, false});
    const MessageRecorder messages;
    options.dumpAllOptions();
    EXPECT_THAT(messages.status(), ElementsAre("Value at index '0' is: 1.\n", "Value at index '1' is: .\n",
                                               "Value at index '2' is: added%s.\n"));
}

}  // namespace
