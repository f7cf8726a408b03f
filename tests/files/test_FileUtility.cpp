#include <gtest/gtest.h>

#include <array>
#include <filesystem>
#include <string>
#include <tuple>
#include <vector>

#include "FileUtility.h"
#include "HkFile.h"
#include "MessageRecorder.h"
#include "TemporaryDirectory.h"

namespace {

using Texts = std::vector<std::string>;

TEST(FileUtility, TakesPathsApart) {
    // A path, its tail, head and base, and whether it is that of an object file.
    const std::tuple<const char*, const char*, const char*, const char*, bool> cases[] = {
        {nullptr, "", "", "", false},
        {"\\", "", "", "\\", false},
        {"a.elf/b\\c", "c", "a.elf/b", "a", false},
        {"abc", "abc", "abc", "abc", false},
        {"/x", "x", "", "/x", false},
        {"a//b.ELF", "b.ELF", "a/", "a//b", true},
        {".elf", ".elf", ".elf", "", false},
        {"", "", "", "", false},
        {"a.t.mem", "a.t.mem", "a.t.mem", "a.t", true}};
    for (const auto& [path, tail, head, base, isObject] : cases) {
        SCOPED_TRACE(path != nullptr ? path : "null");
        EXPECT_STREQ(FileUtility::getTail(path), tail);
        EXPECT_STREQ(FileUtility::getHead(path), head);
        EXPECT_STREQ(FileUtility::getBase(path), base);
        EXPECT_EQ(FileUtility::isObjectFile(path), isObject);
    }
}

TEST(FileUtility, RmdirRemovesTreesAndAlwaysYieldsTrue) {
    const TemporaryDirectory directory;
    const std::string file = directory.write("tree/file", "");
    EXPECT_TRUE(FileUtility::rmdir(file.c_str()) && FileUtility::rmdir(nullptr) && HkFile::exist(file.c_str()));
    EXPECT_TRUE(FileUtility::rmdir((directory / "tree").c_str()) && !HkFile::exist((directory / "tree").c_str()));
}

TEST(FileUtility, CopyFileMakesTheDestinationOrReportsWhatFails) {
    const TemporaryDirectory directory;
    const MessageRecorder recorder;
    const std::string& from = directory.path();
    const std::string blocked = directory.write("file", "content") + "/sub";
    EXPECT_TRUE(FileUtility::copyFile(from.c_str(), (directory / "new/sub").c_str(), "file"));
    EXPECT_EQ(directory.read("new/sub/file"), "content");
    EXPECT_TRUE(recorder.all().empty());
    EXPECT_FALSE(FileUtility::copyFile(from.c_str(), blocked.c_str(), "file"));
    EXPECT_FALSE(FileUtility::copyFile(from.c_str(), nullptr, "file"));
    EXPECT_FALSE(FileUtility::copyFile(from.c_str(), from.c_str(), "absent"));
    EXPECT_FALSE(FileUtility::copyFile(nullptr, from.c_str(), nullptr));
    EXPECT_EQ(recorder.info(), (Texts{"Failed to make destination directory " + blocked + ".\n",
                                      "Failed to make destination directory .\n",
                                      "Failed to copy file from " + from + "/absent to " + from + "/absent.\n",
                                      "Failed to copy file from / to " + from + "/.\n"}));
}

// What climbing and dots of any form give is compared with a model by the fuzz target.
TEST(FileUtility, ConvertPathGivesFullPathsAndReportsThoseThatLeadNowhere) {
    const TemporaryDirectory directory;
    const std::filesystem::path former = std::filesystem::current_path();
    std::filesystem::current_path(directory.make("a/b"));
    const std::string b = HkFile::getcwd().c_str();
    const std::string a = b.substr(0, b.size() - 2);
    const std::string absent = "Path does not exist. Please check the path parameters ";
    // A path, its base, the result and the message.
    const std::array<std::string, 4> cases[] = {
        {"", "", b + "/", ""},
        {"../", "/p", a + "/", ""},
        {"..\\x", "/p", a + "/x", absent + "..\\x, /p\n"},
        {"./../r", "\\p\\q", "\\p/r", absent + "./../r, \\p\\q\n"},
        {"./../../../r", "/p/q", "/p/q/r", absent + "./../../../r, /p/q\n"},
        {"c:foo", "base", "c:foo", ""},
        {"\\x", "base", "\\x", ""},
        {"./.a/b", "/p", "./.a/b", "Illegal input path ./.a/b\n"},
        {"../...", "", "../...", "Illegal input path ../...\n"},
    };
    for (const auto& [path, base, result, message] : cases) {
        const MessageRecorder recorder;
        EXPECT_STREQ(FileUtility::convertPath(path.c_str(), base.c_str()), result.c_str()) << path;
        EXPECT_EQ(recorder.info(), message.empty() ? Texts() : Texts{message});
    }
    std::filesystem::current_path(former);
}

}  // namespace
