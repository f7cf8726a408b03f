// The catalogue of PROM parts and the layout of one device, over tests/data/prom.

#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include <utility>
#include <vector>

#include "BrennwickInfo.h"
#include "DataPath.h"
#include "PromUtility.h"
#include "TessalException.h"

namespace {

using testing::ElementsAre;
using testing::IsEmpty;
using testing::Pointwise;

struct Catalogue : testing::Test {
    Catalogue() { DeviceProfile::setDataPath(TEST_DATA_DIR "/prom"); }
};

MATCHER(IsNamed, "") {
    return std::get<0>(arg).partName == std::get<1>(arg);
}

TEST_F(Catalogue, ListsKeepTheOrderOfTheirFileAndAreReadOnce) {
    const std::vector<promPartAndSizePair> parts = PromUtility::GetPromList();
    ASSERT_EQ(parts.size(), 10U);
    EXPECT_STREQ(parts[0].sizeText, "100");
    EXPECT_STREQ(parts[9].sizeText, "");
    EXPECT_THAT(PromUtility::GetExtendedPromList(), Pointwise(IsNamed(), {"zqr1p", "minus", "alsonosize", "ext"}));
    DeviceProfile::setDataPath(TEST_DATA_DIR);
    EXPECT_TRUE(PromUtility::readPromList());
    EXPECT_EQ(PromUtility::GetPromList().size(), 10U);
}

TEST_F(Catalogue, FamiliesArePickedByNamePatterns) {
    const std::pair<const char*, std::vector<const char*>> cases[] = {
        {"LEGACY", {"ZQ731", "zq731m"}},  {"zqr", {"zqr1p", "zqr1x", "zqr1s"}},
        {"version", {"zqr1p"}},           {"bpi", {"zqr1x"}},
        {"Parallel", {"abc1m", "abc1k"}}, {"other", {}}};
    for (const auto& [family, parts] : cases) {
        EXPECT_THAT(PromUtility::GetSpecificPromList(family), Pointwise(IsNamed(), parts)) << family;
    }
    EXPECT_THAT(PromUtility::GetSpecificPromList(nullptr), IsEmpty());
}

TEST_F(Catalogue, SizesAreLookedUpInTheirFiles) {
    EXPECT_EQ(PromUtility::GetPromSizeByName("ZQ01S"), 2097152);
    EXPECT_EQ(PromUtility::GetPromSizeByName("zqr1p"), -1);
    EXPECT_EQ(PromUtility::GetExtendedPromSizeByName("ZQR1P"), 100) << "the standard list comes first";
    EXPECT_EQ(PromUtility::GetExtendedPromSizeByName("ext"), 77);
    EXPECT_EQ(PromUtility::GetExtendedPromSizeByName("minus"), -1);
    EXPECT_EQ(PromUtility::GetExtendedPromSizeByName("zq01s"), -1);
    EXPECT_THROW(PromUtility::GetPromSizeByName("nosize"), OutOfRangeException);
    EXPECT_THROW(PromUtility::GetExtendedPromSizeByName("nosize"), OutOfRangeException);
    EXPECT_THROW(PromUtility::GetExtendedPromSizeByName("alsonosize"), OutOfRangeException);
}

TEST_F(Catalogue, ALayoutIsThatOfItsDevice) {
    const BrennwickInfo info("layout");
    EXPECT_EQ(info.getFirstBitStreamAddress(false), 16);
    EXPECT_EQ(info.getFirstBitStreamAddress(true), 48);
    EXPECT_EQ(info.getSecondBitStreamAddress(false), 32);
    EXPECT_EQ(info.getSecondBitStreamAddress(true), 2147483647);
    EXPECT_EQ(info.getNumberOfDataStreams(false), 2);
    EXPECT_EQ(info.getNumberOfDataStreams(true), 3);
    EXPECT_THAT(info.getSectorAddress(false), ElementsAre(16, 32, 48));
    EXPECT_THAT(info.getSectorAddress(true), IsEmpty()) << "the device has none";
    EXPECT_THAT(info.getDataStreamAddresses(false, false), ElementsAre(1, 2));
    EXPECT_THAT(info.getDataStreamAddresses(false, true), ElementsAre(3));
    EXPECT_THAT(info.getDataStreamAddresses(true, false), ElementsAre(4, 5, 6));
    EXPECT_THAT(info.getDataStreamAddresses(true, true), ElementsAre(7));
    EXPECT_EQ(BrennwickInfo("nosuchdevice").getFirstBitStreamAddress(false), 0);
}

}  // namespace
