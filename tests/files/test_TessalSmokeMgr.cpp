#include <gtest/gtest.h>

#include <string>

#include "TemporaryDirectory.h"
#include "TessalSmokeMgr.h"

namespace {

TEST(TessalSmokeMgr, WritesWhatIsFormattedAndNothingElse) {
    const TemporaryDirectory directory;
    const std::string path = directory.write("status", "former content");
    {
        TessalSmokeMgr status(path.c_str());
        EXPECT_TRUE(status.smokeStatus("%d ", 5));
        EXPECT_FALSE(status.smokeStatus("%s", ""));
        EXPECT_TRUE(status.smokeStatus("%s", "100% %s"));
        const char* const noFormat = nullptr;
        EXPECT_FALSE(status.smokeStatus(noFormat));
    }
    EXPECT_EQ(directory.read("status"), "5 100% %s");
}

TEST(TessalSmokeMgr, WritesNowhereWithoutAFile) {
    const TemporaryDirectory directory;
    const std::string absent = directory / "absent/status";
    for (const char* path : {directory.path().c_str(), absent.c_str(), "", static_cast<const char*>(nullptr)}) {
        TessalSmokeMgr status(path);
        EXPECT_FALSE(status.smokeStatus("text"));
        EXPECT_TRUE(status.open(path) && status.close());
    }
}

#if defined(__linux__)
TEST(TessalSmokeMgr, SurvivesAFullDisk) {
    TessalSmokeMgr status("/dev/full");
    EXPECT_TRUE(status.smokeStatus("%s", std::string(1 << 20, 'x').c_str()));
}
#endif

}  // namespace
