#include <gtest/gtest.h>

#include <cstring>
#include <set>
#include <string>
#include <utility>

#include "HkDir.h"
#include "HkEnv.h"
#include "HkFile.h"
#include "HkMemory.h"
#include "HkPath.h"
#include "HkStr.h"
#include "TemporaryDirectory.h"

// The sanitizers end a program that asks for more than there is, unless they are told to refuse as the hosts do.
extern "C" const char* __asan_default_options() {  // NOLINT(bugprone-reserved-identifier): their name for it
    return "allocator_may_return_null=1";
}
extern "C" const char* __tsan_default_options() {  // NOLINT(bugprone-reserved-identifier): their name for it
    return "allocator_may_return_null=1";
}

namespace {

const std::string unicodeName = "g\xc3\xa4nsef\xc3\xbc\xc3\x9f\xe2\x82\xac.txt";

using Names = std::set<std::string>;

Names namesIn(const std::string& path, const char* pattern = "*.*", unsigned char flag = 1) {
    Names names;
    const HkDir directory(path.c_str(), flag);
    for (HkDirIterator entry = directory.begin(pattern); entry != directory.end(); ++entry) {
        names.insert(*entry);
    }
    return names;
}

TEST(HkPath, FindsTheExtensionAndCopiesWhatFits) {
    const std::pair<const char*, const char*> cases[] = {
        {"", nullptr},   {"a.", nullptr}, {"a.elf", "elf"},   {"a.1234567", "1234567"},   {"dir.d\\a.m", "m"},
        {".x", nullptr}, {"d/.x.y", "y"}, {"d.d/a", nullptr}, {"a.12345678", "12345678"}, {"a.tar.gz", "gz"},
    };
    for (const auto& [path, extension] : cases) {
        SCOPED_TRACE(path);
        EXPECT_STREQ(HkPath::GetExt(path, nullptr), extension);
        std::string writable(path);
        std::string buffer(HkPath::extensionSize + 1, '#');
        EXPECT_STREQ(HkPath::GetExt(writable.data(), buffer.data()), extension);
        EXPECT_STREQ(buffer.c_str(), std::string(HkStr::View(extension)).substr(0, HkPath::extensionSize - 1).c_str());
        EXPECT_EQ(buffer.back(), '#');
    }
    EXPECT_EQ(HkPath::GetExt(static_cast<const char*>(nullptr), nullptr), nullptr);
}

TEST(HkDir, ListsEveryEntryButItselfAndItsParent) {
    const TemporaryDirectory directory;
    directory.make("sub");
    for (const std::string& name : Names{"a.txt", "B.TXT", ".hidden", unicodeName}) {
        directory.write(name, "");
    }
    EXPECT_EQ(namesIn(directory.path() + "\\"), (Names{"a.txt", "B.TXT", ".hidden", "sub", unicodeName}));
    EXPECT_EQ(namesIn(directory.path(), nullptr).size(), 5U);
    EXPECT_EQ(namesIn(directory.path(), "*.txt"), (Names{"a.txt", "B.TXT", unicodeName}));
    EXPECT_EQ(namesIn(directory.path(), "none"), Names());
#if !defined(_WIN32)
    EXPECT_EQ(namesIn(directory.path(), "*", 0).count(".hidden"), 0U);
#endif
    HkDirIterator entry = HkDir(directory.path().c_str(), 1).begin("a*");
    const HkDirIterator copy = entry;
    EXPECT_EQ(++entry, HkDir("", 1).end());
    EXPECT_EQ(++entry, HkDirIterator());
    EXPECT_STREQ(*copy, "a.txt");
    EXPECT_TRUE(namesIn(directory / "absent").empty() && namesIn("").empty());
    EXPECT_EQ(HkDir(nullptr, 1).begin("*.*"), HkDirIterator());
}

TEST(HkFile, NamesNothingByNullOrTheEmptyText) {
    for (const char* path : {"", static_cast<const char*>(nullptr)}) {
        EXPECT_FALSE(HkFile::exist(path) || HkFile::isdir(path) || HkFile::mkdir(path, true) || HkFile::rmdir(path) ||
                     HkFile::rmtree(path) || HkFile::remove_f(path) || HkFile::copy(path, path));
        EXPECT_TRUE(HkFile::getsize_noopen(path) == 0 && HkFile::open(path, "w") == nullptr);
    }
    EXPECT_TRUE(HkFile::open("name", nullptr) == nullptr && HkEnv::GetEnv(nullptr) == nullptr);
}

TEST(HkFile, MakesAndRemovesDeepDirectories) {
    const TemporaryDirectory directory;
    std::string deep = directory.path();
    for (int depth = 0; depth < 150; ++depth) {
        deep += "/dir\\dir";
    }
    EXPECT_FALSE(HkFile::mkdir(deep.c_str(), false));
    EXPECT_TRUE(HkFile::mkdir((deep + "//last/").c_str(), true) && HkFile::isdir((deep + "/last").c_str()));
    EXPECT_TRUE(HkFile::mkdir(deep.c_str(), true));
    EXPECT_FALSE(HkFile::mkdir(deep.c_str(), false));
    EXPECT_TRUE(HkFile::rmdir((deep + "/last").c_str()) && HkFile::rmtree((directory / "dir").c_str()));
    const std::string file = directory.write("file", "");
    EXPECT_FALSE(HkFile::mkdir(file.c_str(), true) || HkFile::mkdir((file + "/below").c_str(), true));
}

// The path of the file is long, its name outside ASCII.
TEST(HkFile, TellsFilesFromDirectories) {
    const TemporaryDirectory directory;
    const std::string top = directory.make(std::string(200, 'n') + "/" + std::string(200, 'n'));
    const std::string file = top + "/" + unicodeName;
    const std::string absent = top + "/absent";
    std::FILE* const opened = HkFile::open(file.c_str(), "wb");
    ASSERT_NE(opened, nullptr);
    std::fputs("12345", opened);
    std::fclose(opened);
    EXPECT_TRUE(HkFile::exist(file.c_str()) && !HkFile::isdir(file.c_str()) && !HkFile::exist(absent.c_str()));
    EXPECT_TRUE(HkFile::exist(top.c_str()) && HkFile::isdir((top + "\\").c_str()) && HkFile::isdir(HkFile::getcwd()));
    EXPECT_EQ(HkFile::getsize_noopen(file.c_str()), 5);
    EXPECT_TRUE(HkFile::getsize_noopen(absent.c_str()) == 0 && HkFile::getsize_noopen(top.c_str()) == 0);
    EXPECT_TRUE(HkFile::copy(file.c_str(), (top + "/copy").c_str()));
    EXPECT_EQ(namesIn(top), (Names{unicodeName, "copy"}));
    EXPECT_FALSE(HkFile::rmdir(file.c_str()) || HkFile::remove_f(top.c_str()));
    EXPECT_FALSE(HkFile::rmdir(top.c_str())) << "not empty";
    EXPECT_TRUE(HkFile::remove_f(file.c_str()));
    EXPECT_FALSE(HkFile::remove_f(file.c_str()));
}

TEST(HkFile, CopiesContentAndLeavesEverythingAsItWasWhereItFails) {
    const TemporaryDirectory directory;
    std::string content(300000, '\0');
    for (std::size_t i = 0; i < content.size(); ++i) {
        content[i] = static_cast<char>(i * i >> 7);
    }
    directory.write("file", content);
    directory.write("old", "former content");
    directory.write("empty", "");
    directory.make("sub");
    const auto copy = [&](const char* from, const char* to) {
        return HkFile::copy((directory / from).c_str(), (directory / to).c_str());
    };
    EXPECT_TRUE(copy("file", "new") && copy("file", "old"));
    EXPECT_TRUE(directory.read("new") == content && directory.read("old") == content);
    EXPECT_TRUE(copy("empty", "old") && directory.read("old").empty());
    EXPECT_FALSE(copy("file", "file") || copy("file", "sub/../file"));
    EXPECT_FALSE(copy("absent", "file") || copy("sub", "file") || copy("file", "sub") || copy("file", "absent/file"));
    EXPECT_EQ(directory.read("file"), content);
    EXPECT_EQ(namesIn(directory.path()), (Names{"file", "old", "new", "empty", "sub"}));
}

TEST(HkMemory, GrowsAndKeepsTheContent) {
    void* block = hk_realloc(hk_malloc(0), 5);
    std::memcpy(block, "abcd", 5);
    block = hk_realloc(block, 100000);
    volatile std::size_t everything = SIZE_MAX / 4;  // more than any host has
    EXPECT_TRUE(hk_realloc(block, everything) == nullptr && hk_malloc(everything) == nullptr);
    EXPECT_STREQ(static_cast<const char*>(block), "abcd");
    block = hk_realloc(block, 0);
    ASSERT_NE(block, nullptr);
    hk_free(block);
    hk_free(nullptr);
}

}  // namespace
