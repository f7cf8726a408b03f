// The reader of object files: ranges of good files, words about bad ones, and no crash on any.

#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include <tuple>

#include "PromUtility.h"
#include "images/ElfImage.h"
#include "images/Workbench.h"

namespace {

using testing::HasSubstr;
using Mapping = M2IUtil_BramMapping;

/// The small file with a change.
std::string changed(void (*change)(ElfImage&)) {
    ElfImage elf = ElfImage::small();
    change(elf);
    return elf.text();
}

void countElsewhere(ElfImage& elf) {
    elf.count = 0xFFFF;
    elf.sectionsOffset = 122;
    elf.data += std::string(0x1C, '\0') + '\x02' + std::string(0xB, '\0');
}

TEST(Elf, RangesGoFromTheLowestAddressToBehindTheLastByte) {
    const std::tuple<const char*, void (*)(ElfImage&), unsigned int, unsigned int> cases[] = {
        {"32 bits, least significant first", [](ElfImage&) {}, 0x1000, 0x1012},
        {"64 bits, most significant first", [](ElfImage& e) { e = ElfImage::large(); }, 0x80000000, 0x80000002},
        {"an end at 4 GiB", [](ElfImage& e) { (e = ElfImage::large()).entries[0].paddr = 0xFFFFFFFE; }, 0xFFFFFFFE, 0},
        {"load addresses left open", [](ElfImage& e) { e.entries[0].paddr = e.entries[1].paddr = 0; }, 0x1000,
         0x20000002},
        {"entries of other types", [](ElfImage& e) { e.entries[1] = {6, 0xFFFFFFFF, 0, 0, 2, 8}; }, 0x1000, 0x1004},
        {"cleared memory alone", [](ElfImage& e) { e.entries[0].filesz = e.entries[1].filesz = 0; }, 0, 0},
        {"count in section header 0", countElsewhere, 0x1000, 0x1012},
    };
    for (const auto& [name, change, lowest, highest] : cases) {
        const SectionRange range(Workbench().write("a.elf", changed(change)));
        EXPECT_EQ(range.result, Mapping::M2IUTIL_SUCCESS) << name;
        EXPECT_EQ(range.lowest, lowest) << name;
        EXPECT_EQ(range.highest, highest) << name;
    }
}

TEST(Elf, WhatIsWrongIsNamed) {
    const std::pair<const char*, void (*)(ElfImage&)> cases[] = {
        {"no program headers; link it first", [](ElfImage& e) { e.entries.clear(); }},
        {"a program header has 32 bytes, the file says 31", [](ElfImage& e) { e.entrySize = 31; }},
        {"5000 program headers at 0x34 go past the end of the file, 122 bytes", [](ElfImage& e) { e.count = 5000; }},
        {"section header 0, which lies at 0x0 outside", [](ElfImage& e) { e.count = 0xFFFF; }},
        {"program header 1: 0x5 bytes at offset 0x78 go past", [](ElfImage& e) { e.entries[1].filesz = 5; }},
        {"0x2 bytes at offset 0xFFFFFFFF go past", [](ElfImage& e) { e.entries[1].offset = 0xFFFFFFFF; }},
        {"bytes at offset 0xFFFFFFFFFFFFFFFF go past",
         [](ElfImage& e) { (e = ElfImage::large()).entries[0].offset = ~std::uint64_t{0}; }},
        {"0x2 bytes in the file, only 0x1 in memory", [](ElfImage& e) { e.entries[1].memsz = 1; }},
        {"0x1003 to 0x1004 overlaps the segment at 0x1000 to 0x1003", [](ElfImage& e) { e.entries[1].paddr = 0x1003; }},
        {"0x2 bytes at address 0xFFFFFFFF go past the last address",
         [](ElfImage& e) { e.entries[1].paddr = 0xFFFFFFFF; }},
    };
    for (const auto& [message, spoil] : cases) {
        const Workbench bench;
        const std::string path = bench.write("a.elf", changed(spoil));
        EXPECT_EQ(SectionRange(path).result, Mapping::M2IUTIL_MALFORMED) << message;
        EXPECT_THAT(bench.said(), HasSubstr(message));
        EXPECT_EQ(PromUtility::getDataFileSize(path.c_str()), 0U);
    }
    const Workbench bench;
    EXPECT_EQ(SectionRange(bench / "absent.elf").result, Mapping::M2IUTIL_UNREADABLE);
    EXPECT_EQ(SectionRange(bench.path()).result, Mapping::M2IUTIL_UNREADABLE);
}

TEST(Elf, AFileCutShortOrOfAnotherKindIsRefused) {
    for (const ElfImage& elf : {ElfImage::small(), ElfImage::large()}) {
        const Workbench bench;
        const std::string whole = elf.text();
        ASSERT_EQ(whole.size(), 122U);
        for (std::size_t at = 0; at < whole.size(); ++at) {
            const SectionRange cut(bench.write("cut.elf", whole.substr(0, at)));
            EXPECT_EQ(cut.result, Mapping::M2IUTIL_MALFORMED) << at;
            EXPECT_EQ(cut.highest, 0U) << at;
        }
        for (std::size_t at = 0; at < 7; ++at) {  // the identification
            std::string other = whole;
            other[at] = static_cast<char>(~other[at]);
            EXPECT_EQ(SectionRange(bench.write("other.elf", other)).result, Mapping::M2IUTIL_MALFORMED) << at;
        }
    }
}

TEST(DataFileSize, IsTheSpanOfAnObjectFileAndTheSizeOfAnyOther) {
    const Workbench bench;
    const std::string elf = ElfImage::small().text();
    const auto sizeOf = [](const std::string& path) { return PromUtility::getDataFileSize(path.c_str()); };
    EXPECT_EQ(PromUtility::getDataFileSize(nullptr), 0U);
    EXPECT_EQ(sizeOf(bench.write("a.elf", elf)), 0x12U);
    EXPECT_THAT(bench.messages.debug(), testing::Contains("highest 1012, lowest 1000\n"));
    EXPECT_EQ(sizeOf(bench.write("b.ELF", elf)), 122U);
    EXPECT_EQ(sizeOf(bench.write("a.mem", "@2 01020304")), 4U);
    EXPECT_EQ(sizeOf(bench / "absent.bin"), 0U);
    EXPECT_THAT(bench.messages.errors(), testing::IsEmpty());
    EXPECT_EQ(sizeOf(bench / "absent.mem"), 0U);
    EXPECT_EQ(bench.said().substr(bench.said().rfind("M2I")), "M2IUtil processing of file 'absent.mem' failed.\n");
}

}  // namespace
