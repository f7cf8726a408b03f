// What only this kind of host has: links, access rights, descriptors, limits.
#include <gtest/gtest.h>
#include <sys/resource.h>
#include <sys/stat.h>
#include <unistd.h>

#include <atomic>
#include <csignal>
#include <filesystem>
#include <fstream>
#include <string>
#include <thread>

#include "HkFile.h"
#include "TemporaryDirectory.h"

namespace {

namespace fs = std::filesystem;

/// A link is there whatever it leads to.
bool isThere(const std::string& path) {
    return fs::exists(fs::symlink_status(path));
}

TEST(TreeRemoval, RemovesLinksAndFollowsNone) {
    const TemporaryDirectory directory;
    directory.make("tree/sub/empty");
    const std::string file = directory.write("victim/file", "kept");
    const std::string tree = directory / "tree";
    fs::create_symlink(directory / "victim", tree + "/to directory");
    fs::create_symlink("../../victim", tree + "/sub/relative");
    fs::create_symlink(file, tree + "/to file");
    fs::create_symlink("itself", tree + "/itself");
    fs::create_symlink("..", tree + "/to parent");
    for (const char* name : {"tree/new\nline", "tree/back\\slash", "tree/.hidden"}) {
        directory.write(name, "");
    }
    EXPECT_TRUE(HkFile::rmtree(tree.c_str()) && !isThere(tree));
    for (const char* ending : {"", "/", "\\"}) {
        fs::create_symlink(directory / "victim", tree);
        EXPECT_TRUE(HkFile::rmtree((tree + ending).c_str()) && !isThere(tree)) << ending;
    }
    EXPECT_FALSE(HkFile::rmtree(file.c_str()));
    EXPECT_EQ(directory.read("victim/file"), "kept");
}

// Deeper than a path is long, and than a process has descriptors. Disks take their time for each level.
TEST(TreeRemoval, RemovesTreesDeeperThanPathsReach) {
    const TemporaryDirectory directory;
    const fs::path former = fs::current_path();
    fs::current_path(directory.path());
    for (int depth = 0; depth < 1200; ++depth) {
        fs::create_directory("deep");
        fs::current_path("deep");
    }
    std::ofstream("file") << "content";
    fs::current_path(former);
    EXPECT_TRUE(HkFile::rmtree((directory / "deep").c_str()) && !isThere(directory / "deep"));
}

// Root gives its rights up meanwhile; others have none to lose.
TEST(TreeRemoval, GoesOnPastWhatStays) {
    const TemporaryDirectory directory;
    ASSERT_EQ(::chmod(directory.path().c_str(), 0777), 0);
    constexpr uid_t nobody = 65534;
    const uid_t user = ::geteuid();
    ASSERT_EQ(::seteuid(user == 0 ? nobody : user), 0);
    const std::string tree = directory.make("tree");
    const std::string unreadable = directory.make("tree/unreadable but empty");
    for (const char* file : {"tree/unwritable/file", "tree/unsearchable/file", "tree/free/file", "tree/file"}) {
        directory.write(file, "");
    }
    ::chmod((tree + "/unwritable").c_str(), 0500);
    ::chmod((tree + "/unsearchable").c_str(), 0600);
    ::chmod(unreadable.c_str(), 0);
    EXPECT_FALSE(HkFile::rmtree(tree.c_str()));
    EXPECT_EQ(::seteuid(user), 0);
    EXPECT_FALSE(isThere(tree + "/free") || isThere(tree + "/file") || isThere(unreadable));
    ::chmod((tree + "/unwritable").c_str(), 0700);
    ::chmod((tree + "/unsearchable").c_str(), 0700);
    EXPECT_TRUE(isThere(tree + "/unwritable/file") && isThere(tree + "/unsearchable/file"));
}

TEST(TreeRemoval, IsNotLedAwayByALinkPutInADirectorysPlace) {
    const TemporaryDirectory directory;
    directory.write("victim/file", "kept");
    std::atomic<bool> isOver{false};
    std::thread swapper([&] {
        const std::string place = directory / "tree/sub";
        while (!isOver) {
            ::rename(place.c_str(), (directory / "aside").c_str());
            if (::symlink((directory / "victim").c_str(), place.c_str()) == 0) {
                std::this_thread::yield();
                ::unlink(place.c_str());
            }
            ::rename((directory / "aside").c_str(), place.c_str());
        }
    });
    for (int i = 0; i < 150; ++i) {
        directory.make("tree/sub/below");
        for (int sibling = 0; sibling < 30; ++sibling) {  // time between the look at an entry and its turn
            directory.make("tree/" + std::to_string(sibling));
        }
        HkFile::rmtree((directory / "tree").c_str());
    }
    isOver = true;
    swapper.join();
    EXPECT_EQ(directory.read("victim/file"), "kept");
}

TEST(HkFileCopy, KeepsAccessRightsAndLinksAndTakesRegularFilesOnly) {
    const TemporaryDirectory directory;
    const std::string source = directory.write("source", "new");
    const std::string old = directory.write("old", "former");
    const std::string fifo = directory / "fifo";
    ::chmod(source.c_str(), 0500);
    ::chmod(old.c_str(), 0666);
    fs::create_symlink("old", directory / "link");
    EXPECT_TRUE(HkFile::copy(source.c_str(), (directory / "link").c_str()));
    EXPECT_TRUE(HkFile::copy(source.c_str(), (directory / "copy").c_str()));
    ASSERT_EQ(::mkfifo(fifo.c_str(), 0600), 0);
    fs::create_hard_link(old, directory / "hard");
    EXPECT_EQ(fs::status(old).permissions(), fs::perms(0666));
    EXPECT_EQ(fs::status(directory / "copy").permissions(), fs::perms(0500));
    for (const std::string& other : {directory / "link", directory / "hard", fifo, std::string("/dev/null")}) {
        EXPECT_FALSE(HkFile::copy(old.c_str(), other.c_str())) << other;
    }
    EXPECT_FALSE(HkFile::copy(fifo.c_str(), old.c_str()));
    EXPECT_EQ(HkFile::getsize_noopen("/dev/zero"), 0);
    EXPECT_EQ(directory.read("hard"), "new");
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
    EXPECT_EQ(std::distance(fs::directory_iterator(directory.path()), {}), 2) << "no temporary file is left";
}

}  // namespace
