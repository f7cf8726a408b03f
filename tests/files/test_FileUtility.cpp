#include <gtest/gtest.h>

#include <array>
#include <filesystem>
#include <string>
#include <vector>

#include "FileUtility.h"
#include "HkFile.h"
#include "MessageRecorder.h"
#include "TemporaryDirectory.h"

namespace {

using Texts = std::vector<std::string>;

TEST(FileUtility, TakesPathsApart) {
    // A path, its tail, head and base.
    const std::array<const char*, 4> cases[] = {
        {"", "", "", ""},      {".x", ".x", ".x", ""},      {"abc", "abc", "abc", "abc"},
        {"\\", "", "", "\\"},  {"a.b/c", "c", "a.b", "a"},  {"a/b\\c", "c", "a/b", "a/b\\c"},
        {"/x", "x", "", "/x"}, {"abc/", "", "abc", "abc/"}, {"a.t.z", "a.t.z", "a.t.z", "a.t"},
        {nullptr, "", "", ""}, {"a//b", "b", "a/", "a//b"},
    };
    for (const auto& [path, tail, head, base] : cases) {
        SCOPED_TRACE(path != nullptr ? path : "null");
        EXPECT_STREQ(FileUtility::getTail(path), tail);
        EXPECT_STREQ(FileUtility::getHead(path), head);
        EXPECT_STREQ(FileUtility::getBase(path), base);
    }
    for (const char* path : {"a.ELF", "b.Mem", "d.x/a.b.elf"}) {
        EXPECT_TRUE(FileUtility::isObjectFile(path)) << path;
    }
    for (const char* path : {"a", "a.bit", "a.elf/b", "a.elfx", "elf", "a.", "", static_cast<const char*>(nullptr)}) {
        EXPECT_FALSE(FileUtility::isObjectFile(path)) << (path != nullptr ? path : "null");
    }
}

TEST(FileUtility, RmdirRemovesTreesAndAlwaysYieldsTrue) {
    const TemporaryDirectory directory;
    directory.write("tree/a/b/file", "x");
    const std::string file = directory.write("file", "kept");
    const std::string tree = directory / "tree";
    for (const char* path : {tree.c_str(), tree.c_str(), file.c_str(), "", static_cast<const char*>(nullptr)}) {
        EXPECT_TRUE(FileUtility::rmdir(path));
        EXPECT_FALSE(HkFile::exist(tree.c_str()));
    }
    EXPECT_EQ(directory.read("file"), "kept");
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
    EXPECT_FALSE(FileUtility::copyFile(from.c_str(), (directory / "new").c_str(), "absent"));
    EXPECT_FALSE(FileUtility::copyFile(from.c_str(), from.c_str(), "file"));
    EXPECT_FALSE(FileUtility::copyFile(from.c_str(), nullptr, "file"));
    EXPECT_FALSE(FileUtility::copyFile(nullptr, from.c_str(), nullptr));
    const auto copyFailure = [](const std::string& source, const std::string& destination) {
        return "Failed to copy file from " + source + " to " + destination + ".\n";
    };
    EXPECT_EQ(recorder.info(), (Texts{"Failed to make destination directory " + blocked + ".\n",
                                      copyFailure(directory / "absent", directory / "new/absent"),
                                      copyFailure(directory / "file", directory / "file"),
                                      "Failed to make destination directory .\n", copyFailure("/", from + "/")}));
    EXPECT_EQ(recorder.all().front().file, "../s/FileUtility");
    EXPECT_EQ(directory.read("file"), "content");
}

TEST(FileUtility, ConvertPathGivesFullPaths) {
    const TemporaryDirectory directory;
    const std::filesystem::path former = std::filesystem::current_path();
    std::filesystem::current_path(directory.make("a/b"));
    const std::string b = HkFile::getcwd().c_str();
    const std::string a = b.substr(0, b.size() - 2);
    const std::string top = b.substr(0, b.size() - 4);
    std::string tooHigh = "x";
    for (int i = 0; i < 100; ++i) {
        tooHigh.insert(0, "../");
    }
    // A path, its base, the result.
    const std::array<std::string, 3> cases[] = {
        {"", "", b + "/"},       {tooHigh, "", b + "/x"},     {"./../../r", "/p/q", "/r"},
        {"r", "", b + "/r"},     {"../x:y", "", "../x:y"},    {"./r/s", "/p/q", "/p/q/r/s"},
        {"..", "", b + "/"},     {"..\\x", "/p", a + "/x"},   {"./../r", "\\p\\q", "\\p/r"},
        {"../", "", a + "/"},    {"c:foo", "base", "c:foo"},  {"/x/../y", "base", "/x/../y"},
        {"", "/p/q", "/p/q/"},   {"./../r", "/p/q", "/p/r"},  {"r/../.s", "/p", "/p/r/../.s"},
        {"\\x", "base", "\\x"},  {"r/s", "/p/q", "/p/q/r/s"}, {"../../d/e", "/p", top + "/d/e"},
        {"..", "/p/q", "/p/q/"}, {".//.\\\\r", "/q", "/q/r"}, {"./../../../r", "/p/q", "/p/q/r"},
    };
    for (const auto& [path, base, result] : cases) {
        const MessageRecorder recorder;
        EXPECT_STREQ(FileUtility::convertPath(path.c_str(), base.c_str()), result.c_str()) << path;
        const std::string absence =
            "Path does not exist. Please check the path parameters " + path + ", " + base + "\n";
        const bool isThere = path == result || HkFile::exist(result.c_str());
        EXPECT_EQ(recorder.info(), isThere ? Texts() : Texts{absence});
    }
    std::filesystem::current_path(former);
}

TEST(FileUtility, ConvertPathRefusesOtherDotsAtTheFront) {
    for (const char* path : {".a", "..a", "...", "../...", "./.a/b", "....", ".../x"}) {
        const MessageRecorder recorder;
        EXPECT_STREQ(FileUtility::convertPath(path, "/p"), path);
        EXPECT_EQ(recorder.info(), Texts{std::string("Illegal input path ") + path + "\n"});
    }
}

}  // namespace
