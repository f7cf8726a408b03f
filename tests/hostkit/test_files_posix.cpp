// What only this kind of host has: links, access rights, descriptors, limits.
#if !defined(_WIN32)

#include <fcntl.h>
#include <gtest/gtest.h>
#include <sys/resource.h>
#include <sys/stat.h>
#include <unistd.h>

#include <atomic>
#include <csignal>
#include <string>
#include <thread>

#include "HkFile.h"
#include "TemporaryDirectory.h"

namespace {

bool isThere(const std::string& path) {
    struct stat status {};
    return ::lstat(path.c_str(), &status) == 0;
}

mode_t rightsOf(const std::string& path) {
    struct stat status {};
    return ::stat(path.c_str(), &status) == 0 ? status.st_mode & 0777 : 0;
}

void makeLink(const std::string& target, const std::string& link) {
    ASSERT_EQ(::symlink(target.c_str(), link.c_str()), 0);
}

/// Takes the root's rights away while it lives; others have none to lose.
class WithoutPrivileges {
public:
    WithoutPrivileges() {
        if (m_isRoot) {
            EXPECT_EQ(::seteuid(nobody), 0);
        }
    }
    ~WithoutPrivileges() {
        if (m_isRoot) {
            EXPECT_EQ(::seteuid(0), 0);
        }
    }
    WithoutPrivileges(const WithoutPrivileges&) = delete;
    WithoutPrivileges& operator=(const WithoutPrivileges&) = delete;

private:
    static constexpr uid_t nobody = 65534;
    const bool m_isRoot = ::geteuid() == 0;
};

TEST(TreeRemoval, RemovesLinksAndFollowsNone) {
    const TemporaryDirectory directory;
    HkFile::mkdir((directory / "victim/sub").c_str(), true);
    const std::string file = directory.write("victim/file", "kept");
    const std::string tree = directory / "tree";
    HkFile::mkdir((tree + "/sub/empty").c_str(), true);
    makeLink(directory / "victim", tree + "/to directory");
    makeLink("../../victim", tree + "/sub/relative");
    makeLink(file, tree + "/to file");
    makeLink(directory / "absent", tree + "/dangling");
    makeLink("itself", tree + "/itself");
    makeLink("..", tree + "/to parent");
    directory.write("tree/new\nline", "");
    directory.write("tree/back\\slash", "");
    directory.write("tree/.hidden", "");
    EXPECT_TRUE(HkFile::rmtree(tree.c_str()));
    EXPECT_FALSE(isThere(tree));
    for (const char* ending : {"", "/", "\\"}) {
        makeLink(directory / "victim", tree);
        EXPECT_TRUE(HkFile::rmtree((tree + ending).c_str()));
        EXPECT_FALSE(isThere(tree));
    }
    EXPECT_FALSE(HkFile::rmtree(file.c_str()));
    EXPECT_EQ(directory.read("victim/file"), "kept");
    EXPECT_TRUE(HkFile::isdir((directory / "victim/sub").c_str()));
}

// Deeper than a path is long, and than a process has descriptors. Disks take their time for each level.
TEST(TreeRemoval, RemovesTreesDeeperThanPathsReach) {
    const TemporaryDirectory directory;
    int place = ::open(directory.path().c_str(), O_RDONLY | O_DIRECTORY);
    for (int depth = 0; depth < 1200; ++depth) {
        ASSERT_EQ(::mkdirat(place, "deep", 0700), 0);
        const int next = ::openat(place, "deep", O_RDONLY | O_DIRECTORY);
        ::close(place);
        place = next;
    }
    ::close(::openat(place, "file", O_CREAT | O_WRONLY, 0600));
    ::close(place);
    EXPECT_TRUE(HkFile::rmtree((directory / "deep").c_str()));
    EXPECT_FALSE(isThere(directory / "deep"));
}

TEST(TreeRemoval, GoesOnPastWhatStays) {
    const TemporaryDirectory directory;
    ASSERT_EQ(::chmod(directory.path().c_str(), 0777), 0);
    const std::string tree = directory / "tree";
    {
        const WithoutPrivileges user;
        for (const char* name : {"unwritable", "unsearchable", "free", "unreadable but empty"}) {
            HkFile::mkdir((tree + "/" + name).c_str(), true);
        }
        for (const char* name : {"unwritable/file", "unsearchable/file", "free/file", "file"}) {
            directory.write(std::string("tree/") + name, "");
        }
        ::chmod((tree + "/unwritable").c_str(), 0500);
        ::chmod((tree + "/unsearchable").c_str(), 0600);
        ::chmod((tree + "/unreadable but empty").c_str(), 0);
        EXPECT_FALSE(HkFile::rmtree(tree.c_str()));
    }
    EXPECT_TRUE(isThere(tree + "/unwritable/file") || ::geteuid() != 0);
    EXPECT_FALSE(isThere(tree + "/free"));
    EXPECT_FALSE(isThere(tree + "/file"));
    EXPECT_FALSE(isThere(tree + "/unreadable but empty"));
    ::chmod((tree + "/unwritable").c_str(), 0700);
    ::chmod((tree + "/unsearchable").c_str(), 0700);
    EXPECT_TRUE(isThere(tree + "/unwritable/file") && isThere(tree + "/unsearchable/file"));
}

TEST(TreeRemoval, IsNotLedAwayByALinkPutInADirectorysPlace) {
    const TemporaryDirectory directory;
    HkFile::mkdir((directory / "victim").c_str(), false);
    directory.write("victim/file", "kept");
    std::atomic<bool> isOver{false};
    std::thread swapper([&] {
        const std::string place = directory / "tree/sub";
        while (!isOver) {
            ::rename(place.c_str(), (directory / "aside").c_str());
            if (::symlink((directory / "victim").c_str(), place.c_str()) == 0) {
                ::unlink(place.c_str());
            }
            ::rename((directory / "aside").c_str(), place.c_str());
        }
    });
    for (int i = 0; i < 150; ++i) {
        HkFile::mkdir((directory / "tree/sub/below").c_str(), true);
        HkFile::rmtree((directory / "tree").c_str());
    }
    isOver = true;
    swapper.join();
    EXPECT_EQ(directory.read("victim/file"), "kept");
}

TEST(HkFileCopy, KeepsAccessRightsAndLinks) {
    const TemporaryDirectory directory;
    const std::string source = directory.write("source", "new");
    const std::string old = directory.write("old", "former");
    ::chmod(source.c_str(), 0500);
    ::chmod(old.c_str(), 0666);
    makeLink("old", directory / "link");
    EXPECT_TRUE(HkFile::copy(source.c_str(), (directory / "link").c_str()));
    EXPECT_EQ(directory.read("old"), "new");
    EXPECT_EQ(rightsOf(old), 0666U);
    EXPECT_TRUE(HkFile::copy(source.c_str(), (directory / "copy").c_str()));
    EXPECT_EQ(rightsOf(directory / "copy"), 0500U);
    EXPECT_FALSE(HkFile::copy(old.c_str(), (directory / "link").c_str()));
    ASSERT_EQ(::link(old.c_str(), (directory / "hard").c_str()), 0);
    EXPECT_FALSE(HkFile::copy(old.c_str(), (directory / "hard").c_str()));
    EXPECT_EQ(directory.read("hard"), "new");
}

TEST(HkFileCopy, TakesRegularFilesOnly) {
    const TemporaryDirectory directory;
    const std::string fifo = directory / "fifo";
    const std::string file = directory.write("file", "kept");
    ASSERT_EQ(::mkfifo(fifo.c_str(), 0600), 0);
    EXPECT_FALSE(HkFile::copy(fifo.c_str(), file.c_str()));
    EXPECT_FALSE(HkFile::copy(file.c_str(), fifo.c_str()));
    EXPECT_FALSE(HkFile::copy(file.c_str(), "/dev/null"));
    EXPECT_EQ(HkFile::getsize_noopen("/dev/zero"), 0);
    EXPECT_EQ(directory.read("file"), "kept");
}

TEST(HkFileCopy, LeavesTheOldFileWhenThereIsNoRoom) {
    const TemporaryDirectory directory;
    const std::string source = directory.write("source", std::string(1 << 20, 'x'));
    const std::string old = directory.write("old", "former");
    rlimit former{};
    ::getrlimit(RLIMIT_FSIZE, &former);
    const auto formerHandler = std::signal(SIGXFSZ, SIG_IGN);
    const rlimit small{1 << 16, former.rlim_max};
    ::setrlimit(RLIMIT_FSIZE, &small);
    const bool isCopied = HkFile::copy(source.c_str(), old.c_str());
    ::setrlimit(RLIMIT_FSIZE, &former);
    std::signal(SIGXFSZ, formerHandler);
    EXPECT_FALSE(isCopied);
    EXPECT_EQ(directory.read("old"), "former");
    EXPECT_TRUE(HkFile::remove_f(old.c_str()) && HkFile::remove_f(source.c_str()));
    EXPECT_TRUE(HkFile::rmdir(directory.path().c_str()));  // no temporary file is left
}

}  // namespace

#endif
