// A disk that is full and places where no file can be: the old file stays, nothing half done is left.

#include <gmock/gmock.h>
#include <gtest/gtest.h>
#include <signal.h>
#include <sys/resource.h>
#include <sys/stat.h>

#include <algorithm>
#include <filesystem>

#include "images/Workbench.h"

namespace {

/// Lets no file grow past the size: a disk with that much room.
void limitFiles(rlim_t size) {
    rlimit limit{};
    ::getrlimit(RLIMIT_FSIZE, &limit);
    limit.rlim_cur = std::min(size, limit.rlim_max);
    ::setrlimit(RLIMIT_FSIZE, &limit);
}

TEST(Faults, AFullDiskLeavesTheOldFilesAndNoHalfOnes) {
    const auto former = ::signal(SIGXFSZ, SIG_IGN);
    Workbench bench;
    bench.write("a", noise(100000));
    for (const std::string format : {"mcs", "exo", "tek", "hex", "bin"}) {
        bench.write("p_1." + format, "old");
        for (const rlim_t room : std::initializer_list<rlim_t>{0, 1, 4096, 90000}) {
            limitFiles(room);
            const bool isDone = bench.generate("-size 128 1M -output p -data @a -format " + format);
            limitFiles(RLIM_INFINITY);
            EXPECT_FALSE(isDone) << room;
            EXPECT_THAT(bench.said(), testing::HasSubstr("cannot be written: File too large")) << room;
        }
        EXPECT_EQ(bench.read("p_1." + format), "old");
    }
    EXPECT_EQ(bench.content().size(), 6U) << "nothing but the data and the old files";
    ::signal(SIGXFSZ, former);
}

TEST(Faults, ALinkIsFollowedAndWhatIsNoPlainFileIsNeitherReadNorReplaced) {
    Workbench bench;
    bench.write("a", "abc");
    ASSERT_EQ(::mkfifo((bench / "pipe").c_str(), 0600), 0);
    std::filesystem::create_symlink("pipe", bench / "p.mcs");
    EXPECT_FALSE(bench.generate("-generic -output p -data @a"));
    EXPECT_THAT(bench.said(), testing::HasSubstr("p.mcs: cannot be made or replaced: Invalid argument"));
    EXPECT_FALSE(bench.generate("-generic -output q -data /dev/zero"));
    EXPECT_THAT(bench.said(), testing::HasSubstr("/dev/zero: is no plain file"));
    EXPECT_TRUE(std::filesystem::is_fifo(bench / "p.mcs"));
    std::filesystem::create_symlink(bench.write("old", ""), bench / "r.mcs");
    EXPECT_TRUE(bench.generate("-generic -output r -data @a"));
    EXPECT_EQ(bench.read("old").substr(0, 1), ":");
}

}  // namespace
