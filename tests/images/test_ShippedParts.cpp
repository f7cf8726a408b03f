// The shipped catalogue and layouts agree with each other.

#include <gtest/gtest.h>

#include <algorithm>

#include "BrennwickInfo.h"
#include "DataPath.h"
#include "PromUtility.h"

namespace {

TEST(ShippedParts, EveryFamilyHasPartsAndEveryPartASize) {
    DeviceProfile::setDataPath(SHIPPED_DATA_DIR);
    for (const char* const family : {"legacy", "zqr", "version", "bpi", "parallel"}) {
        EXPECT_FALSE(PromUtility::GetSpecificPromList(family).empty()) << family;
    }
    for (const std::vector<promPartAndSizePair>& list :
         {PromUtility::GetPromList(), PromUtility::GetExtendedPromList()}) {
        EXPECT_FALSE(list.empty());
        for (const promPartAndSizePair& part : list) {
            EXPECT_GE(PromUtility::GetExtendedPromSizeByName(part.partName), 0x8000) << part.partName.c_str();
        }
    }
    EXPECT_EQ(PromUtility::GetPromSizeByName("zqr16p"), PromUtility::GetExtendedPromSizeByName("zqr16p"));
}

TEST(ShippedParts, LayoutsAreCompleteAndLieInsideTheirPart) {
    DeviceProfile::setDataPath(SHIPPED_DATA_DIR);
    for (const char* const part : {"zqr16p", "zqr32p", "zqr128x"}) {
        const BrennwickInfo info(part);
        for (const bool second : {false, true}) {
            const int size = PromUtility::GetExtendedPromSizeByName(part) / (second ? 2 : 1);
            const std::vector<std::int32_t> sectors = info.getSectorAddress(second);
            ASSERT_FALSE(sectors.empty()) << part;
            EXPECT_TRUE(std::is_sorted(sectors.begin(), sectors.end()) && sectors.back() < size) << part;
            EXPECT_TRUE(std::binary_search(sectors.begin(), sectors.end(), info.getFirstBitStreamAddress(second)));
            EXPECT_TRUE(std::binary_search(sectors.begin(), sectors.end(), info.getSecondBitStreamAddress(second)));
            for (const bool mb : {false, true}) {
                const std::vector<std::int32_t> streams = info.getDataStreamAddresses(mb, second);
                EXPECT_EQ(static_cast<int>(streams.size()), info.getNumberOfDataStreams(mb)) << part;
                EXPECT_TRUE(std::includes(sectors.begin(), sectors.end(), streams.begin(), streams.end())) << part;
            }
        }
    }
}

}  // namespace
