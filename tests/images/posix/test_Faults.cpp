// A disk that is full and a directory that cannot be written: the old file stays, nothing half done is left.

#include <gmock/gmock.h>
#include <gtest/gtest.h>
#include <signal.h>
#include <sys/resource.h>
#include <sys/stat.h>
#include <unistd.h>

#include <filesystem>

#include "images/Workbench.h"

namespace {

std::ptrdiff_t entriesOf(const std::string& directory) {
    const std::filesystem::directory_iterator entries(directory);
    return std::distance(begin(entries), end(entries));
}

/// While it lives no file may grow past the size: a disk with that much room.
class FullDisk {
public:
    explicit FullDisk(rlim_t size) : m_handler(::signal(SIGXFSZ, SIG_IGN)) {
        ::getrlimit(RLIMIT_FSIZE, &m_former);
        rlimit small = m_former;
        small.rlim_cur = size;
        ::setrlimit(RLIMIT_FSIZE, &small);
    }
    ~FullDisk() {
        ::setrlimit(RLIMIT_FSIZE, &m_former);
        ::signal(SIGXFSZ, m_handler);
    }
    FullDisk(const FullDisk&) = delete;
    FullDisk& operator=(const FullDisk&) = delete;

private:
    sighandler_t m_handler;
    rlimit m_former{};
};

TEST(Faults, AFullDiskLeavesTheOldFilesAndNoHalfOnes) {
    Workbench bench;
    bench.write("a", noise(100000));
    for (const char* const format : {"mcs", "exo", "tek", "hex", "bin"}) {
        const std::string file = std::string("p_1.") + format;
        bench.write(file, "old");
        for (const rlim_t room : std::initializer_list<rlim_t>{0, 1, 4096, 90000}) {
            const FullDisk disk(room);
            EXPECT_FALSE(bench.generate(std::string("-size 128 1M -output p -data @a -format ") + format)) << room;
            EXPECT_THAT(bench.said(), testing::HasSubstr("cannot be written: File too large")) << room;
        }
        EXPECT_EQ(bench.read(file), "old");
        std::filesystem::remove(bench / file);
        EXPECT_EQ(entriesOf(bench.path()), 1);
    }
}

TEST(Faults, ADirectoryThatCannotBeWrittenIsNamed) {
    Workbench bench;
    bench.write("a", "abc");
    bench.write("a.mcs", "old");
    ::chmod(bench.path().c_str(), 0555);
    const uid_t user = ::geteuid();
    constexpr uid_t nobody = 65534;
    if (user == 0) {
        ASSERT_EQ(::seteuid(nobody), 0);  // access rights do not bind the superuser
    }
    EXPECT_FALSE(bench.generate("-generic -data @a"));
    ASSERT_EQ(::seteuid(user), 0);
    ::chmod(bench.path().c_str(), 0700);
    EXPECT_THAT(bench.said(), testing::HasSubstr("a.mcs: cannot be made or replaced: Permission denied"));
    EXPECT_EQ(bench.read("a.mcs"), "old");
}

TEST(Faults, ADeviceIsNeitherReadNorReplaced) {
    Workbench bench;
    bench.write("a", "abc");
    std::filesystem::create_symlink("/dev/full", bench / "p.mcs");
    EXPECT_FALSE(bench.generate("-generic -output p -data @a"));
    EXPECT_FALSE(bench.generate("-generic -output q -data /dev/zero"));
    EXPECT_THAT(bench.said(), testing::HasSubstr("/dev/zero: is no plain file"));
    EXPECT_TRUE(std::filesystem::is_symlink(bench / "p.mcs"));
}

TEST(Faults, ALinkStaysAndTheFileKeepsItsRights) {
    Workbench bench;
    bench.write("a", "abc");
    bench.write("real", "old");
    ::chmod((bench / "real").c_str(), 0640);
    std::filesystem::create_symlink("real", bench / "p.mcs");
    EXPECT_TRUE(bench.generate("-generic -output p -data @a")) << bench.said();
    EXPECT_TRUE(std::filesystem::is_symlink(bench / "p.mcs"));
    EXPECT_EQ(bench.read("real").substr(0, 9), ":02000004");
    struct stat status {};
    ::stat((bench / "real").c_str(), &status);
    EXPECT_EQ(status.st_mode & 0777U, 0640U);
}

}  // namespace
