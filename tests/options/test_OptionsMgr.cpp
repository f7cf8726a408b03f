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
    using U_OptionsMgr::setOptionsList;
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

const std::vector<U_AttributePair> groupTable = {flag("-ver"),  flag("0", 6),   flag("rp"),  flag("wp"),
                                                 flag("erase"), flag("verify"), flag("frc"), text("customercode:")};

TEST(OptionsMgr, AGroupIsOneTextOfItsLeaderAndTheMembersThatAreGiven) {
    TestOptions options(groupTable);
    EXPECT_THAT(options.texts(0, 8), IsEmpty());
    options.set(2, true);
    options.set(7, "1234");
    EXPECT_THAT(options.texts(0, 8), IsEmpty()) << "members count only behind a leader that is on";
    options.set(1, true);
    EXPECT_THAT(options.texts(0, 8), ElementsAre("0 rp customercode:1234"));
    options.set(0, true);
    options.set(5, true);
    options.set(7, "a b");
    EXPECT_THAT(options.texts(0, 8), ElementsAre("-ver", "0 rp verify customercode:a b"));
    EXPECT_THAT(options.texts(1, 2), ElementsAre("0 rp verify customercode:a b")) << "a group is read past the range";
    options.clearOptions(2, 100);
    EXPECT_THAT(options.texts(0, 8), ElementsAre("-ver", "0"));
}

TEST(OptionsMgr, PlainRowsGiveTheirDashValueAndText) {
    TestOptions options({flag("-e"), text("-u"), text(""), flag(""), flag("-n", -3), flag("-x")});
    for (int row : {0, 3, 4, 5}) {
        EXPECT_TRUE(options.set(row, true));
    }
    EXPECT_TRUE(options.set(1, "a \"b\" c"));
    EXPECT_TRUE(options.set(2, "never seen"));
    EXPECT_THAT(options.texts(0, 6), ElementsAre("-e", "-u", "a \"b\" c", "", "-n", "-x"));
}

TEST(OptionsMgr, RowsAndRangesOutsideTheTableAreRefused) {
    constexpr int most = std::numeric_limits<int>::max();
    constexpr int least = std::numeric_limits<int>::min();
    TestOptions options({flag("-a", most), text("-b")});
    EXPECT_TRUE(options.set(0, true));
    EXPECT_TRUE(options.set(1, "x"));
    for (int row : {-1, 2, least, most}) {
        SCOPED_TRACE(row);
        EXPECT_FALSE(options.set(row, true) || options.set(row, "x") || options.setOption(row, "x", true, true));
        EXPECT_FALSE(options.getOption(row) || options.isOptionSet(row) || options.isOptionBool(row));
        EXPECT_TRUE(options.getOptionString(row).IsEmpty());
    }
    EXPECT_THAT(options.texts(least, most), ElementsAre("-a -bx"));
    EXPECT_THAT(options.texts(2, 2), IsEmpty());
    options.clearOptions(1, 1);
    options.clearOptions(most, least);
    EXPECT_STREQ(options.getOptionString(1), "x");
    EXPECT_THAT(TestOptions({}).getOptions(groupTable, 0, 8), IsEmpty()) << "more descriptions than rows";
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

TEST(OptionsMgr, FurtherRowsStandBehindAndCommittingChangesNothing) {
    TestOptions options(groupTable);
    options.set(0, true);
    options.init_options(groupTable);
    options.commit_options(groupTable);
    options.commit_options(-1, groupTable);
    EXPECT_TRUE(options.getOption(0) && !options.getOption(8));
    EXPECT_TRUE(options.isOptionBool(14) && !options.isOptionBool(15));
    options.addOption({"added", false, false});
    EXPECT_STREQ(options.getOptionString(16), "added");
    options.setOptionsList({{"only", false, false}});
    EXPECT_STREQ(options.getOptionString(0), "only");
    EXPECT_STREQ(options.getOptionEnabledText(), "_OptionEnabled");
    EXPECT_STREQ(options.getAssociatedDeviceText(), "_AssociatedDevice");
    const MessageRecorder messages;
    options.setOptionsList({{"", true, true}, {"x%s", false, false}});
    options.dumpAllOptions();
    EXPECT_THAT(messages.status(), ElementsAre("Value at index '0' is: 1.\n", "Value at index '1' is: x%s.\n"));
}

}  // namespace
