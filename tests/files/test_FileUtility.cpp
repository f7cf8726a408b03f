#include <gtest/gtest.h>

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
    struct Case {
        const char* path;
        const char* tail;
        const char* head;
        const char* base;
    };
    const Case cases[] = {
        {"a/b\\c", "c", "a/b", "a/b\\c"},
        {"abc", "abc", "abc", "abc"},
        {"abc/", "", "abc", "abc/"},
        {"/x", "x", "", "/x"},
        {"\\", "", "", "\\"},
        {"", "", "", ""},
        {nullptr, "", "", ""},
        {"a.tar.gz", "a.tar.gz", "a.tar.gz", "a.tar"},
        {"a.b/c", "c", "a.b", "a"},
        {".x", ".x", ".x", ""},
        {"a//b", "b", "a/", "a//b"},
    };
    for (const Case& c : cases) {
        SCOPED_TRACE(c.path != nullptr ? c.path : "null");
        EXPECT_STREQ(FileUtility::getTail(c.path), c.tail);
        EXPECT_STREQ(FileUtility::getHead(c.path), c.head);
        EXPECT_STREQ(FileUtility::getBase(c.path), c.base);
    }
}

TEST(FileUtility, KnowsObjectFilesByTheirExtension) {
    for (const char* path : {"a.ELF", "b.Mem", "d.x/a.b.elf"}) {
        EXPECT_TRUE(FileUtility::isObjectFile(path)) << path;
    }
    for (const char* path : {"a", "a.bit", "a.elf/b", "a.elfx", "elf", "a.", "", static_cast<const char*>(nullptr)}) {
        EXPECT_FALSE(FileUtility::isObjectFile(path)) << (path != nullptr ? path : "null");
    }
}

TEST(FileUtility, RmdirRemovesTreesAndAlwaysYieldsTrue) {
    const TemporaryDirectory directory;
    HkFile::mkdir((directory / "tree/a/b").c_str(), true);
    HkFile::mkdir((directory / "tree/.hidden").c_str(), true);
    directory.write("tree/a/b/file", "x");
    directory.write("tree/.hidden/.file", "x");
    const std::string file = directory.write("file", "kept");
    EXPECT_TRUE(FileUtility::rmdir((directory / "tree").c_str()));
    EXPECT_FALSE(HkFile::exist((directory / "tree").c_str()));
    for (const char* path : {file.c_str(), (directory / "absent").c_str(), "", static_cast<const char*>(nullptr)}) {
        EXPECT_TRUE(FileUtility::rmdir(path));
    }
    EXPECT_EQ(directory.read("file"), "kept");
}

TEST(FileUtility, CopyFileMakesTheDestination) {
    const TemporaryDirectory directory;
    const MessageRecorder recorder;
    directory.write("file", "content");
    EXPECT_TRUE(FileUtility::copyFile(directory.path().c_str(), (directory / "new/sub").c_str(), "file"));
    EXPECT_EQ(directory.read("new/sub/file"), "content");
    EXPECT_TRUE(recorder.all().empty());
}

TEST(FileUtility, CopyFileReportsWhatFails) {
    const TemporaryDirectory directory;
    const MessageRecorder recorder;
    const std::string& from = directory.path();
    const std::string blocked = directory.write("file", "content") + "/sub";
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

/// Makes a directory the current one while it lives.
class CurrentDirectory {
public:
    explicit CurrentDirectory(const std::string& path) : m_former(std::filesystem::current_path()) {
        std::filesystem::current_path(path);
    }
    ~CurrentDirectory() { std::filesystem::current_path(m_former); }
    CurrentDirectory(const CurrentDirectory&) = delete;
    CurrentDirectory& operator=(const CurrentDirectory&) = delete;

private:
    std::filesystem::path m_former;
};

TEST(FileUtility, ConvertPathGivesFullPaths) {
    const TemporaryDirectory directory;
    HkFile::mkdir((directory / "a/b").c_str(), true);
    const CurrentDirectory current(directory / "a/b");
    const std::string b = HkFile::getcwd().c_str();
    const std::string a = b.substr(0, b.size() - 2);
    const std::string top = b.substr(0, b.size() - 4);
    const std::string tooHigh = [] {
        std::string path;
        for (int i = 0; i < 100; ++i) {
            path += "../";
        }
        return path + "x";
    }();
    struct Case {
        std::string path;
        std::string base;
        std::string result;
    };
    const Case cases[] = {
        {"/x/../y", "base", "/x/../y"},
        {"\\x", "base", "\\x"},
        {"c:foo", "base", "c:foo"},
        {"../x:y", "", "../x:y"},
        {"r/s", "/p/q", "/p/q/r/s"},
        {"./r/s", "/p/q", "/p/q/r/s"},
        {".//.\\\\r", "/p/q", "/p/q/r"},
        {"./../r", "/p/q", "/p/r"},
        {"./../r", "\\p\\q", "\\p/r"},
        {"./../../r", "/p/q", "/r"},
        {"./../../../r", "/p/q", "/p/q/r"},
        {"", "/p/q", "/p/q/"},
        {"..", "/p/q", "/p/q/"},
        {"r/../.s", "/p/q", "/p/q/r/../.s"},
        {"r", "", b + "/r"},
        {"", "", b + "/"},
        {"..", "", b + "/"},
        {"../", "", a + "/"},
        {"..\\x", "/p/q", a + "/x"},
        {"../../d/e.txt", "/p/q", top + "/d/e.txt"},
        {tooHigh, "", b + "/x"},
    };
    for (const Case& c : cases) {
        const MessageRecorder recorder;
        EXPECT_STREQ(FileUtility::convertPath(c.path.c_str(), c.base.c_str()), c.result.c_str()) << c.path;
        const bool isThere = c.path == c.result || HkFile::exist(c.result.c_str());
        EXPECT_EQ(recorder.info(), isThere ? Texts()
                                           : Texts{"Path does not exist. Please check the path parameters " + c.path +
                                                   ", " + c.base + "\n"});
    }
}

TEST(FileUtility, ConvertPathRefusesOtherDotsAtTheFront) {
    for (const char* path : {".a", "..a", "...", "../...", "./.a/b", "....", ".../x"}) {
        const MessageRecorder recorder;
        EXPECT_STREQ(FileUtility::convertPath(path, "/p"), path);
        EXPECT_EQ(recorder.info(), Texts{std::string("Illegal input path ") + path + "\n"});
    }
}

TEST(FileUtility, ConvertPathTakesLongPaths) {
    const MessageRecorder recorder;
    std::string climbing;
    std::string root;
    for (int i = 0; i < 300000; ++i) {
        climbing += "../";
        root += "/d";
    }
    EXPECT_STREQ(FileUtility::convertPath(("./" + climbing + "x").c_str(), root.c_str()), "/x");
    EXPECT_EQ(recorder.info().size(), 1U);
}

}  // namespace
