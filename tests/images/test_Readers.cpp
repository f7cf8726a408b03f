// The readers of object files and memory text: bytes at their addresses, words about what is wrong, no crash on any.

#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include <cstdint>
#include <iomanip>
#include <sstream>
#include <vector>

#include "PromUtility.h"
#include "images/Workbench.h"
#include "imagetools/ObjectFile.h"

namespace {

using ImageTools::MemOptions;
using testing::HasSubstr;
using Mapping = M2IUtil_BramMapping;

class Readers : public testing::Test {
protected:
    /// "[address:bytes ...]" for the segments of a file, or the first line of what is wrong with it.
    std::string read(const std::string& name, const std::string& content, const MemOptions& options = {}) {
        bench.messages.clear();
        const std::string path = bench.write(name, content);
        ImageTools::LoadedFile file;
        if (loadFile(path.c_str(), ImageTools::kindOf(path.c_str()), options, file) != ImageTools::LoadResult::Done) {
            return bench.said().substr(0, bench.said().find('\n')).substr(name.size() + 1);
        }
        std::ostringstream result;
        result << std::hex << std::uppercase << std::setfill('0');
        for (const ImageTools::Segment& segment : file.segments.all()) {
            result << (result.tellp() > 0 ? " " : "") << segment.address << ':';
            for (std::size_t i = 0; i < segment.size; ++i) {
                result << std::setw(2) << static_cast<unsigned>(segment.data[i]);
            }
        }
        return '[' + result.str() + ']';
    }

    Workbench bench;
};

/// An ELF file, good or bad.
struct ElfImage {
    struct Entry {
        std::uint64_t type, offset, vaddr, paddr, filesz, memsz;
    };

    bool isLarge;                    ///< of 64 bits, most significant byte first
    std::uint64_t entrySize, count;  ///< e_phentsize and e_phnum
    std::vector<Entry> entries;
    std::string data;                  ///< behind the headers
    std::uint64_t sectionsOffset = 0;  ///< e_shoff

    /// Two segments, 4 bytes at 0x1000 and 2 at 0x1010: 122 bytes.
    static ElfImage small() {
        return {false,
                0x20,
                2,
                {{1, 0x74, 0x1000, 0x1000, 4, 4}, {1, 0x78, 0x20000000, 0x1010, 2, 8}},
                "\x01\x02\x03\x04\xAA\xBB"};
    }
    /// One segment: 2 bytes at 0x80000000, 122 bytes too.
    static ElfImage large() { return {true, 0x38, 1, {{1, 0x78, 0x80000000, 0x80000000, 2, 2}}, "\x12\x34"}; }

    std::string text() const {
        const unsigned word = isLarge ? 8 : 4;
        const std::uint64_t headerSize = isLarge ? 0x40 : 0x34;
        std::string out = "\177ELF";
        put(out, 1, {word / 4, isLarge ? 2U : 1U, 1, 0, 0, 0, 0, 0, 0, 0, 0, 0});
        put(out, 2, {2, 0});
        put(out, 4, {1});
        put(out, word, {0, headerSize, sectionsOffset});
        put(out, 4, {0});
        put(out, 2, {headerSize, entrySize, count, 0, 0, 0});
        for (const Entry& e : entries) {
            put(out, word, {isLarge ? e.type << (8 * word - 32) : e.type});  // with the flags of 64 bits
            put(out, word, {e.offset, e.vaddr, e.paddr, e.filesz, e.memsz});
            put(out, 4, {0, 0});
        }
        return out + data;
    }

private:
    void put(std::string& out, unsigned width, std::initializer_list<std::uint64_t> values) const {
        for (const std::uint64_t value : values) {
            for (unsigned i = 0; i < width; ++i) {
                out += static_cast<char>(value >> 8 * (isLarge ? width - 1 - i : i) & 0xFF);
            }
        }
    }
};

void countElsewhere(ElfImage& elf) {
    elf.count = 0xFFFF;
    elf.sectionsOffset = 122;
    elf.data += std::string(0x1C, '\0') + '\x02' + std::string(0xB, '\0');
}

TEST_F(Readers, GiveTheBytesThatAnElfFileLoadsOrNameWhatIsWrong) {
    const std::pair<const char*, void (*)(ElfImage&)> cases[] = {
        {"[1000:01020304 1010:AABB]", [](ElfImage&) {}},
        {"[80000000:1234]", [](ElfImage& e) { e = ElfImage::large(); }},
        {"[1000:01020304 20000000:AABB]", [](ElfImage& e) { e.entries[0].paddr = e.entries[1].paddr = 0; }},
        {"[1000:01020304]", [](ElfImage& e) { e.entries[1] = {6, 0xFFFFFFFF, 0, 0, 2, 8}; }},
        {"[]", [](ElfImage& e) { e.entries[0].filesz = e.entries[1].filesz = 0; }},
        {"[1000:01020304 1010:AABB]", countElsewhere},
        {"no program headers; link it first", [](ElfImage& e) { e.count = 0; }},
        {"a program header has 32 bytes, the file says 31", [](ElfImage& e) { e.entrySize = 31; }},
        {"5000 program headers at 0x34 go past the end of the file, 122 bytes", [](ElfImage& e) { e.count = 5000; }},
        {"section header 0, which lies at 0x0 outside", [](ElfImage& e) { e.count = 0xFFFF; }},
        {"program header 1: 0x5 bytes at offset 0x78 go past", [](ElfImage& e) { e.entries[1].filesz = 5; }},
        {"bytes at offset 0xFFFFFFFFFFFFFFFF go past",
         [](ElfImage& e) { (e = ElfImage::large()).entries[0].offset = ~std::uint64_t{0}; }},
        {"0x2 bytes in the file, only 0x1 in memory", [](ElfImage& e) { e.entries[1].memsz = 1; }},
        {"0x1003 to 0x1004 overlaps the segment at 0x1000 to 0x1003", [](ElfImage& e) { e.entries[1].paddr = 0x1003; }},
        {"0x2 bytes at address 0xFFFFFFFF go past the last address",
         [](ElfImage& e) { e.entries[1].paddr = 0xFFFFFFFF; }},
    };
    for (const auto& [result, change] : cases) {
        ElfImage elf = ElfImage::small();
        change(elf);
        EXPECT_THAT(read("a.elf", elf.text()), HasSubstr(result));
    }
}

TEST_F(Readers, RefuseAnElfFileCutShortOrOfAnotherKind) {
    for (const ElfImage& elf : {ElfImage::small(), ElfImage::large()}) {
        const std::string whole = elf.text();
        ASSERT_EQ(whole.size(), 122U);
        for (std::size_t at = 0; at < whole.size(); ++at) {
            EXPECT_THAT(read("cut.elf", whole.substr(0, at)), testing::Not(HasSubstr("["))) << at;
        }
        for (std::size_t at = 0; at < 7; ++at) {  // the identification
            std::string other = whole;
            other[at] = static_cast<char>(~other[at]);
            EXPECT_THAT(read("other.elf", other), testing::Not(HasSubstr("["))) << at;
        }
    }
}

TEST_F(Readers, GiveTheBytesOfMemoryTextOrItsFirstMistake) {
    struct Case {
        const char* text;
        const char* result;
        MemOptions options = {};
    };
    const Case cases[] = {
        {"", "[]"},
        {"@00000400 01020304 05060708", "[1000:0102030405060708]"},
        {"aB_cD // 99\n/* 11 */ 2345/*x*/\r\n", "[0:ABCD2345]"},
        {"01 @5 @10 02", "[0:01 10:02]"},
        {"@2 02 @1 01 02 03", "[1:01 2:02 3:03]"},
        {"@FFFFFFFF FF", "[FFFFFFFF:FF]"},
        {"@0_1 FF", "[1:FF]"},
        {"/**/", "[]"},
        {"01\n@ 5", "2:1: expected hexadecimal digits directly behind @"},
        {"@5g 01", "1:1: expected hexadecimal digits behind @, not \"@5g\""},
        {"@100000000 01", "1:1: address \"@100000000\" is past the last one, 0xFFFFFFFF"},
        {"@FFFFFFFF 0102", "1:11: the word at address 0x1FFFFFFFE goes past the last one, 0xFFFFFFFF"},
        {"@FFFFFFFF 01 02", "1:14: the word at address 0x100000000 goes past the last one, 0xFFFFFFFF"},
        {"0102\r03", "2:1: a word of 2 digits, the first one has 4"},
        {"012", "1:1: a word of 3 digits holds no whole number of bytes up to 1024"},
        {"  01x2", "1:3: unknown bits in \"01x2\""},
        {":00000001FF", "1:1: expected a word of hexadecimal digits or @, not \":00000001FF\""},
        {"_1", "1:1: expected a word of hexadecimal digits or @, not \"_1\""},
        {"01 /* 02", "1:4: the comment is not closed, expected */"},
        {"@1 01 @1 02", "1:10: the data from here gives address 0x1 another byte than the data before"},
        {"@4 01020304", "[10:04030201]", {true, false, false}},
        {"@4 01020304", "[4:01020304]", {false, true, false}},
        {"0x Z0", "[0:0FF0]", {false, false, true}},
    };
    for (const Case& c : cases) {
        EXPECT_EQ(read("a.mem", c.text, c.options), c.result) << c.text;
    }
}

TEST_F(Readers, TellTheRangeFromTheLowestAddressToBehindTheLastByte) {
    ElfImage ending = ElfImage::large();
    ending.entries[0].paddr = 0xFFFFFFFE;
    const char* const mistakes = "! ! ! ! ! ! ! ! ! ! ! ! ! ! ! ! ! ! ! ! ! ! ! ! !";
    EXPECT_EQ(sectionRange(bench.write("a.elf", ElfImage::small().text())),
              SectionRange(Mapping::M2IUTIL_SUCCESS, 0x1000, 0x1012));
    EXPECT_EQ(sectionRange(bench.write("ending.elf", ending.text())),
              SectionRange(Mapping::M2IUTIL_SUCCESS, 0xFFFFFFFE, 0));
    EXPECT_EQ(sectionRange(bench.write("a.mem", mistakes)), SectionRange(Mapping::M2IUTIL_MALFORMED, 0, 0));
    EXPECT_EQ(bench.messages.info().size(), 20U) << "of 25 mistakes";
    EXPECT_EQ(sectionRange(bench / "absent.elf"), SectionRange(Mapping::M2IUTIL_UNREADABLE, 0, 0));
    EXPECT_EQ(sectionRange(bench.path()), SectionRange(Mapping::M2IUTIL_UNREADABLE, 0, 0));
}

TEST_F(Readers, MakeTheDataFileSizeTheSpanOfAnObjectFile) {
    const std::string elf = ElfImage::small().text();
    const auto sizeOf = [](const std::string& path) { return PromUtility::getDataFileSize(path.c_str()); };
    EXPECT_EQ(PromUtility::getDataFileSize(nullptr), 0U);
    EXPECT_EQ(sizeOf(bench.write("a.elf", elf)), 0x12U);
    EXPECT_EQ(sizeOf(bench.write("b.ELF", elf)), 122U);
    EXPECT_EQ(sizeOf(bench.write("a.mem", "@2 01020304")), 4U);
    EXPECT_EQ(sizeOf(bench / "absent.bin"), 0U);
    EXPECT_THAT(bench.messages.errors(), testing::IsEmpty());
    EXPECT_EQ(sizeOf(bench / "absent.mem"), 0U);
    EXPECT_THAT(bench.said(), testing::EndsWith("\nM2IUtil processing of file 'absent.mem' failed.\n"));
}

}  // namespace
