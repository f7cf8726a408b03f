// What only this kind of host has: write protection of files, sharing, reparse points.
#include <gtest/gtest.h>
#include <process.h>
#include <windows.h>

#include <filesystem>
#include <string>

#include "HkFile.h"
#include "TemporaryDirectory.h"

namespace {

void protect(const std::string& path) {
    ASSERT_NE(SetFileAttributesA(path.c_str(), FILE_ATTRIBUTE_READONLY), 0);
}

TEST(TreeRemoval, RemovesProtectedFilesAndGoesOnPastThoseInUse) {
    const TemporaryDirectory directory;
    protect(directory.write("tree/protected", ""));
    const std::string used = directory.write("tree/sub/used", "");
    directory.write("tree/sub/deep/free", "");
    HANDLE const user = CreateFileA(used.c_str(), GENERIC_READ, 0, nullptr, OPEN_EXISTING, 0, nullptr);
    ASSERT_NE(user, INVALID_HANDLE_VALUE);
    EXPECT_FALSE(HkFile::rmtree((directory / "tree").c_str()));
    EXPECT_TRUE(HkFile::exist(used.c_str()));
    for (const char* gone : {"tree/protected", "tree/sub/deep"}) {
        EXPECT_FALSE(HkFile::exist((directory / gone).c_str())) << gone;
    }
    CloseHandle(user);
    EXPECT_TRUE(HkFile::rmtree((directory / "tree\\").c_str()) && !HkFile::exist((directory / "tree").c_str()));
}

// The runtime that the tests have shows links of its own host as reparse points, but cannot make or remove any.
TEST(TreeRemoval, StopsAtReparsePoints) {
    const TemporaryDirectory directory;
    directory.write("victim/file", "kept");
    directory.make("tree");
    const std::string link = directory / "tree/link";
    if (CreateSymbolicLinkA(link.c_str(), (directory / "victim").c_str(), SYMBOLIC_LINK_FLAG_DIRECTORY) == 0 ||
        !HkFile::exist(link.c_str())) {
        const std::filesystem::path former = std::filesystem::current_path();
        std::filesystem::current_path(directory / "tree");
        _spawnl(_P_WAIT, "Z:\\bin\\ln", "ln", "-s", "../victim", "link", nullptr);
        std::filesystem::current_path(former);
        for (int i = 0; i < 100 && !HkFile::exist(link.c_str()); ++i) {
            Sleep(20);  // a program of the other kind is not waited for
        }
    }
    if (!HkFile::exist(link.c_str())) {
        GTEST_SKIP() << "no link can be made here";
    }
    EXPECT_TRUE(HkFile::isdir(link.c_str()));
    EXPECT_FALSE(HkFile::rmdir(link.c_str()));
    HkFile::rmtree((directory / "tree").c_str());
    HkFile::rmtree(link.c_str());
    EXPECT_EQ(directory.read("victim/file"), "kept");
}

TEST(HkFileCopy, RefusesAProtectedDestination) {
    const TemporaryDirectory directory;
    const std::string source = directory.write("source", "new");
    const std::string old = directory.write("old", "kept");
    protect(old);
    EXPECT_FALSE(HkFile::copy(source.c_str(), old.c_str()));
    EXPECT_EQ(directory.read("old"), "kept");
    EXPECT_TRUE(HkFile::remove_f(old.c_str()) && HkFile::remove_f(source.c_str()));
    EXPECT_TRUE(HkFile::rmdir(directory.path().c_str()));  // no temporary file is left
}

}  // namespace
