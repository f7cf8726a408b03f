// The reader of object files: ranges of good files, words about bad ones, and no crash on any.

#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include "M2IUtil_Data_Utils.h"
#include "PromUtility.h"
#include "images/ElfImage.h"
#include "images/Workbench.h"

namespace {

using testing::HasSubstr;
using Mapping = M2IUtil_BramMapping;

struct Range {
    Mapping::M2IUtil_Results result;
    unsigned int lowest = 1;
    unsigned int highest = 1;
};

Range rangeOf(const std::string& path) {
    Range range{};
    const M2IUtil_Data_Utils reader(path.c_str(), DUMP_BY_DEFAULT, &range.result);
    reader.GetProgramSectionAddressRange(&range.lowest, &range.highest);
    return range;
}

TEST(Elf, RangesGoFromTheLowestAddressToBehindTheLastByte) {
    ElfImage atTheEnd = ElfImage::large();
    atTheEnd.entries[0].paddr = 0xFFFFFFFE;
    ElfImage noLoadAddress = ElfImage::small();
    noLoadAddress.entries[0].paddr = noLoadAddress.entries[1].paddr = 0;
    ElfImage otherTypes = ElfImage::small();
    otherTypes.entries[1].type = 6;
    otherTypes.entries[1].offset = 0xFFFFFFFF;
    ElfImage onlyCleared = ElfImage::small();
    onlyCleared.entries[0].filesz = onlyCleared.entries[1].filesz = 0;
    ElfImage countElsewhere = ElfImage::small();
    countElsewhere.count = 0xFFFF;
    countElsewhere.sectionsOffset = 122;
    countElsewhere.data += std::string(0x1C, '\0') + '\x02' + std::string(0xB, '\0');
    struct Case {
        const char* name;
        ElfImage elf;
        unsigned int lowest;
        unsigned int highest;
    };
    const Case cases[] = {
        {"32 bits, least significant first", ElfImage::small(), 0x1000, 0x1012},
        {"64 bits, most significant first", ElfImage::large(), 0x80000000, 0x80000002},
        {"an end at 4 GiB", atTheEnd, 0xFFFFFFFE, 0},
        {"load addresses left open", noLoadAddress, 0x1000, 0x20000002},
        {"entries of other types", otherTypes, 0x1000, 0x1004},
        {"cleared memory alone", onlyCleared, 0, 0},
        {"count in section header 0", countElsewhere, 0x1000, 0x1012},
    };
    for (const Case& c : cases) {
        const Workbench bench;
        const Range range = rangeOf(bench.write("a.elf", c.elf.text()));
        EXPECT_EQ(range.result, Mapping::M2IUTIL_SUCCESS) << c.name;
        EXPECT_EQ(range.lowest, c.lowest) << c.name;
        EXPECT_EQ(range.highest, c.highest) << c.name;
    }
}

TEST(Elf, WhatIsWrongIsNamed) {
    struct Case {
        const char* message;
        void (*spoil)(ElfImage&);
    };
    const Case cases[] = {
        {"no program headers; link it first", [](ElfImage& e) { e.entries.clear(); }},
        {"a program header has 32 bytes, the file says 31", [](ElfImage& e) { e.entrySize = 31; }},
        {"5000 program headers at 0x34 go past the end of the file, 122 bytes", [](ElfImage& e) { e.count = 5000; }},
        {"section header 0, which lies at 0x0 outside", [](ElfImage& e) { e.count = 0xFFFF; }},
        {"program header 1: 0x5 bytes at offset 0x78 go past", [](ElfImage& e) { e.entries[1].filesz = 5; }},
        {"0x2 bytes at offset 0xFFFFFFFF go past", [](ElfImage& e) { e.entries[1].offset = 0xFFFFFFFF; }},
        {"0x2 bytes in the file, only 0x1 in memory", [](ElfImage& e) { e.entries[1].memsz = 1; }},
        {"0x1003 to 0x1004 overlaps the segment at 0x1000 to 0x1003", [](ElfImage& e) { e.entries[1].paddr = 0x1003; }},
        {"0x2 bytes at address 0xFFFFFFFF go past the last address",
         [](ElfImage& e) { e.entries[1].paddr = 0xFFFFFFFF; }},
    };
    for (const Case& c : cases) {
        Workbench bench;
        ElfImage elf = ElfImage::small();
        c.spoil(elf);
        const std::string path = bench.write("a.elf", elf.text());
        EXPECT_EQ(rangeOf(path).result, Mapping::M2IUTIL_MALFORMED) << c.message;
        EXPECT_THAT(bench.said(), HasSubstr(c.message));
        EXPECT_EQ(PromUtility::getDataFileSize(path.c_str()), 0U);
    }
    ElfImage wrapping = ElfImage::large();
    wrapping.entries[0].offset = ~std::uint64_t{0};
    const Workbench bench;
    EXPECT_EQ(rangeOf(bench.write("wrapping.elf", wrapping.text())).result, Mapping::M2IUTIL_MALFORMED);
    EXPECT_EQ(rangeOf(bench / "absent.elf").result, Mapping::M2IUTIL_UNREADABLE);
    EXPECT_EQ(rangeOf(bench.path()).result, Mapping::M2IUTIL_UNREADABLE);
}

TEST(Elf, AFileCutShortIsRefusedAndNoChangedByteDoesHarm) {
    for (const ElfImage& elf : {ElfImage::small(), ElfImage::large()}) {
        const Workbench bench;
        const std::string whole = elf.text();
        ASSERT_EQ(whole.size(), 122U);
        for (std::size_t size = 0; size < whole.size(); ++size) {
            const Range range = rangeOf(bench.write("cut.elf", whole.substr(0, size)));
            EXPECT_EQ(range.result, Mapping::M2IUTIL_MALFORMED) << size;
            EXPECT_EQ(range.highest, 0U) << size;
        }
        for (std::size_t at = 0; at < whole.size(); ++at) {
            for (const char flip : {'\x01', '\x80', '\xFF'}) {
                std::string changed = whole;
                changed[at] = static_cast<char>(changed[at] ^ flip);
                const Range range = rangeOf(bench.write("changed.elf", changed));
                EXPECT_TRUE(at >= 7 || range.result == Mapping::M2IUTIL_MALFORMED) << "identification, byte " << at;
            }
        }
    }
}

TEST(DataFileSize, IsTheSpanOfAnObjectFileAndTheSizeOfAnyOther) {
    Workbench bench;
    EXPECT_EQ(PromUtility::getDataFileSize(nullptr), 0U);
    EXPECT_EQ(PromUtility::getDataFileSize(bench.write("a.elf", ElfImage::small().text()).c_str()), 0x12U);
    EXPECT_THAT(bench.messages.debug(), testing::Contains("highest 1012, lowest 1000\n"));
    EXPECT_EQ(PromUtility::getDataFileSize(bench.write("a.ELF", ElfImage::small().text()).c_str()), 122U);
    EXPECT_EQ(PromUtility::getDataFileSize(bench.write("a.mem", "@2 01020304").c_str()), 4U);
    EXPECT_EQ(PromUtility::getDataFileSize((bench / "absent.bin").c_str()), 0U);
    EXPECT_THAT(bench.messages.errors(), testing::IsEmpty());
    const std::string absent = bench / "absent.mem";
    EXPECT_EQ(PromUtility::getDataFileSize(absent.c_str()), 0U);
    EXPECT_THAT(bench.messages.errors(), testing::ElementsAre("M2IUtil processing of file '" + absent + "' failed.\n"));
}

}  // namespace
