#include <gtest/gtest.h>

#include <algorithm>
#include <cstring>
#include <set>
#include <string>
#include <vector>

#include "HkDir.h"
#include "HkEnv.h"
#include "HkFile.h"
#include "HkMemory.h"
#include "HkPath.h"
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

std::set<std::string> namesIn(const std::string& path, const char* pattern = "*.*", unsigned char flag = 1) {
    std::set<std::string> names;
    const HkDir directory(path.c_str(), flag);
    for (HkDirIterator entry = directory.begin(pattern); entry != directory.end(); ++entry) {
        names.insert(*entry);
    }
    return names;
}

TEST(HkPath, FindsTheExtension) {
    struct Case {
        const char* path;
        const char* extension;  // null: none
        const char* cut;
    };
    const Case cases[] = {
        {"a.elf", "elf", "elf"},
        {"a.tar.gz", "gz", "gz"},
        {"dir.d/a", nullptr, ""},
        {"dir.d\\a.m", "m", "m"},
        {"", nullptr, ""},
        {".profile", nullptr, ""},
        {"a.", nullptr, ""},
        {"..", nullptr, ""},
        {"a.longextension", "longextension", "longext"},
        {"a.1234567", "1234567", "1234567"},
        {"d/.x.y", "y", "y"},
        {nullptr, nullptr, ""},
    };
    for (const Case& c : cases) {
        SCOPED_TRACE(c.path != nullptr ? c.path : "null");
        EXPECT_STREQ(HkPath::GetExt(c.path, nullptr), c.extension);
        std::string writable(c.path != nullptr ? c.path : "");
        char buffer[HkPath::extensionSize + 1];
        std::memset(buffer, '#', sizeof buffer);
        char* const place = HkPath::GetExt(writable.data(), buffer);
        EXPECT_STREQ(buffer, c.cut);
        EXPECT_EQ(buffer[HkPath::extensionSize], '#');
        EXPECT_EQ(place == nullptr, c.extension == nullptr);
    }
}

TEST(HkDir, ListsEveryEntryButItselfAndItsParent) {
    const TemporaryDirectory directory;
    const std::set<std::string> names = {"a.txt", "B.TXT", ".hidden", "noextension", "sub", unicodeName};
    for (const std::string& name : names) {
        name == "sub" ? void(HkFile::mkdir((directory / name).c_str(), false))
                      : void(std::fclose(HkFile::open((directory / name).c_str(), "w")));
    }
    EXPECT_EQ(namesIn(directory.path()), names);
    EXPECT_EQ(namesIn(directory.path() + "\\", nullptr), names);
    EXPECT_EQ(namesIn(directory.path(), "*.txt"), (std::set<std::string>{"a.txt", "B.TXT", unicodeName}));
    EXPECT_EQ(namesIn(directory.path(), "none"), std::set<std::string>());
#if !defined(_WIN32)
    EXPECT_EQ(namesIn(directory.path(), "*", 0).count(".hidden"), 0U);
#endif
    const std::string absent = directory / "absent";
    for (const char* path : {absent.c_str(), "", static_cast<const char*>(nullptr)}) {
        const HkDir none(path, 1);
        EXPECT_EQ(none.begin("*.*"), none.end());
    }
}

TEST(HkDir, GoesOnWhileEntriesAreRemoved) {
    const TemporaryDirectory directory;
    constexpr int count = 1000;
    for (int i = 0; i < count; ++i) {
        directory.write("file" + std::to_string(i), "");
    }
    int seen = 0;
    const HkDir listing(directory.path().c_str(), 1);
    HkDirIterator copy = listing.begin("*.*");
    const std::string first = *copy;
    for (HkDirIterator entry = copy; entry != listing.end(); ++entry, ++seen) {
        EXPECT_TRUE(HkFile::remove_f((directory / *entry).c_str())) << *entry;
    }
    EXPECT_EQ(seen, count);
    EXPECT_EQ(*copy, first);
    HkDirIterator end = listing.end();
    EXPECT_EQ(++end, listing.end());
    EXPECT_EQ(namesIn(directory.path()), std::set<std::string>());
}

TEST(HkFile, NamesNothingByNullOrTheEmptyText) {
    for (const char* path : {"", static_cast<const char*>(nullptr)}) {
        EXPECT_FALSE(HkFile::exist(path) || HkFile::isdir(path) || HkFile::mkdir(path, true) || HkFile::rmdir(path) ||
                     HkFile::rmtree(path) || HkFile::remove_f(path) || HkFile::copy(path, path));
        EXPECT_EQ(HkFile::getsize_noopen(path), 0);
        EXPECT_EQ(HkFile::open(path, "w"), nullptr);
    }
    EXPECT_EQ(HkFile::open("name", nullptr), nullptr);
}

TEST(HkFile, TellsFilesFromDirectories) {
    const TemporaryDirectory directory;
    const std::string file = directory.write("file", std::string(70000, 'x'));
    const std::string named = directory / unicodeName;
    std::FILE* const opened = HkFile::open(named.c_str(), "wb");
    ASSERT_NE(opened, nullptr);
    std::fputs("12345", opened);
    std::fclose(opened);
    EXPECT_TRUE(HkFile::exist(file.c_str()) && !HkFile::isdir(file.c_str()));
    EXPECT_TRUE(HkFile::exist(directory.path().c_str()) && HkFile::isdir((directory.path() + "\\").c_str()));
    EXPECT_FALSE(HkFile::exist((directory / "absent").c_str()));
    EXPECT_EQ(HkFile::getsize_noopen(file.c_str()), 70000);
    EXPECT_EQ(HkFile::getsize_noopen(named.c_str()), 5);
    EXPECT_EQ(HkFile::getsize_noopen((directory / "absent").c_str()), 0);
    EXPECT_EQ(HkFile::getsize_noopen(directory.path().c_str()), 0);
    EXPECT_FALSE(HkFile::rmdir(file.c_str()));
    EXPECT_FALSE(HkFile::remove_f(directory.path().c_str()));
    EXPECT_FALSE(HkFile::rmdir(directory.path().c_str()));  // not empty
    EXPECT_TRUE(HkFile::remove_f(named.c_str()));
    EXPECT_FALSE(HkFile::remove_f(named.c_str()));
    EXPECT_TRUE(HkFile::isdir(HkFile::getcwd()));
}

TEST(HkFile, MakesDirectories) {
    const TemporaryDirectory directory;
    const std::string deep = directory / "a\\b/c//d/";
    EXPECT_FALSE(HkFile::mkdir(deep.c_str(), false));
    EXPECT_TRUE(HkFile::mkdir(deep.c_str(), true));
    EXPECT_TRUE(HkFile::isdir((directory / "a/b/c/d").c_str()));
    EXPECT_TRUE(HkFile::mkdir(deep.c_str(), true));
    EXPECT_FALSE(HkFile::mkdir((directory / "a").c_str(), false));
    EXPECT_TRUE(HkFile::rmdir((directory / "a/b/c/d").c_str()));
    directory.write("file", "");
    EXPECT_FALSE(HkFile::mkdir((directory / "file").c_str(), true));
    EXPECT_FALSE(HkFile::mkdir((directory / "file/below").c_str(), true));
}

TEST(HkFile, TakesLongPaths) {
    const TemporaryDirectory directory;
    std::string path = directory.path();
    while (path.size() < 600) {
        path += "/" + std::string(50, 'n');
    }
    ASSERT_TRUE(HkFile::mkdir(path.c_str(), true));
    const std::string file = path + "/file.txt";
    std::FILE* const opened = HkFile::open(file.c_str(), "w");
    ASSERT_NE(opened, nullptr);
    std::fclose(opened);
    EXPECT_TRUE(HkFile::copy(file.c_str(), (path + "/copy.txt").c_str()));
    EXPECT_EQ(namesIn(path), (std::set<std::string>{"file.txt", "copy.txt"}));
    EXPECT_TRUE(HkFile::rmtree((directory / std::string(50, 'n')).c_str()));
}

TEST(HkFile, CopiesContent) {
    const TemporaryDirectory directory;
    std::string content(300000, '\0');
    for (std::size_t i = 0; i < content.size(); ++i) {
        content[i] = static_cast<char>(i * i >> 7);
    }
    const std::string source = directory.write("source", content);
    for (const char* name : {"new", "old"}) {
        directory.write("old", "former content");
        EXPECT_TRUE(HkFile::copy(source.c_str(), (directory / name).c_str()));
        EXPECT_EQ(directory.read(name), content);
    }
    const std::string empty = directory.write("empty", "");
    EXPECT_TRUE(HkFile::copy(empty.c_str(), (directory / "old").c_str()));
    EXPECT_EQ(HkFile::getsize_noopen((directory / "old").c_str()), 0);
    EXPECT_EQ(namesIn(directory.path()), (std::set<std::string>{"source", "new", "old", "empty"}));
}

TEST(HkFile, AFailedCopyLeavesEverythingAsItWas) {
    const TemporaryDirectory directory;
    const std::string file = directory.write("file", "content");
    HkFile::mkdir((directory / "sub").c_str(), false);
    const std::string absent = directory / "absent";
    const std::string sub = directory / "sub";
    EXPECT_FALSE(HkFile::copy(file.c_str(), file.c_str()));
    EXPECT_FALSE(HkFile::copy(file.c_str(), (directory / "sub/../file").c_str()));
    EXPECT_FALSE(HkFile::copy(absent.c_str(), file.c_str()));
    EXPECT_FALSE(HkFile::copy(sub.c_str(), file.c_str()));
    EXPECT_FALSE(HkFile::copy(file.c_str(), sub.c_str()));
    EXPECT_FALSE(HkFile::copy(file.c_str(), (directory / "absent/file").c_str()));
    EXPECT_EQ(directory.read("file"), "content");
    EXPECT_EQ(namesIn(directory.path()), (std::set<std::string>{"file", "sub"}));
}

TEST(HkMemory, GrowsAndKeepsTheContent) {
    void* block = hk_malloc(0);
    ASSERT_NE(block, nullptr);
    block = hk_realloc(block, 4);
    std::memcpy(block, "abcd", 4);
    block = hk_realloc(block, 100000);
    EXPECT_EQ(std::memcmp(block, "abcd", 4), 0);
    volatile std::size_t everything = SIZE_MAX / 4;  // more than any host has
    EXPECT_EQ(hk_realloc(block, everything), nullptr);
    EXPECT_EQ(hk_malloc(everything), nullptr);
    EXPECT_EQ(std::memcmp(block, "abcd", 4), 0);
    block = hk_realloc(block, 0);
    ASSERT_NE(block, nullptr);
    hk_free(block);
    hk_free(nullptr);
}

TEST(HkEnv, TellsUnsetFromSet) {
    EXPECT_EQ(HkEnv::GetEnv("TESSAL_NO_SUCH_VARIABLE"), nullptr);
    EXPECT_EQ(HkEnv::GetEnv(nullptr), nullptr);
    EXPECT_NE(HkEnv::GetEnv("PATH"), nullptr);
}

}  // namespace
