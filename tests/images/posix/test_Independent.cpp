// What the generator writes, read back by programs that nobody here wrote; what linkers write, read here.

#include <gtest/gtest.h>
#include <sys/wait.h>

#include <algorithm>
#include <cstdlib>
#include <sstream>

#include "M2IUtil_Data_Utils.h"
#include "images/Workbench.h"

namespace {

/// Runs a command line in a directory, its output going to the file "out" there; true when it succeeds.
bool runs(const Workbench& bench, const std::string& command) {
    const int status = std::system(("cd " + bench.path() + " && ( " + command + " ) > out 2>&1").c_str());
    return WIFEXITED(status) && WEXITSTATUS(status) == 0;
}

#define NEEDS(bench, program)                        \
    if (!runs(bench, "command -v " program)) {       \
        GTEST_SKIP() << program " is not installed"; \
    }

/// The data files "a", 3 bytes short of 200 KiB, and "b" of 300 bytes.
const std::string a = noise(200 * 1024 - 3);
const std::string b = noise(300, 7);

struct Layout {
    const char* arguments;
    std::uint64_t a;
    std::uint64_t b;

    std::uint64_t lowest() const { return std::min(a, b); }
    /// The content of the PROM from the lowest address up, computed as plainly as can be.
    std::string image() const {
        std::string image(std::max(a + ::a.size(), b + ::b.size()) - lowest(), '\xFF');
        image.replace(a - lowest(), ::a.size(), ::a);
        return image.replace(b - lowest(), ::b.size(), ::b);
    }
};

const Layout layouts[] = {
    {"-up 0 -data @a -up 40000 -data @b", 0, 0x40000},
    {"-up FFF1 -data @a -up FF -data @b", 0xFFF1, 0xFF},
    {"-up 12FF0003 -data @a -up 13123456 -data @b", 0x12FF0003, 0x13123456},
};

std::string mirrored(std::string text) {
    for (char& ch : text) {
        unsigned result = 0;
        for (unsigned bit = 0; bit < 8; ++bit) {
            result |= (static_cast<unsigned char>(ch) >> bit & 1U) << (7 - bit);
        }
        ch = static_cast<char>(result);
    }
    return text;
}

struct Format {
    const char* name;
    const char* reader;  ///< srec_cat's word for it
    const char* target;  ///< objcopy's word for it; empty where it has none
};

const Format formats[] = {{"mcs", "-intel", "ihex"}, {"exo", "-motorola", "srec"}, {"tek", "-tektronix-extended", ""}};

TEST(Independent, RecordFilesComeBackAsTheDataTheyWereMadeOf) {
    Workbench bench;
    NEEDS(bench, "srec_cat");
    NEEDS(bench, "objcopy");
    bench.write("a", a);
    bench.write("b", b);
    for (const Layout& layout : layouts) {
        for (const Format& format : formats) {
            for (const bool swapped : {false, true}) {
                const std::string line = std::string("-generic -output p -fillValue FF -format ") + format.name +
                                         (swapped ? " " : " -disableswap ") + layout.arguments;
                ASSERT_TRUE(bench.generate(line)) << bench.said();
                bench.write("expected", swapped ? mirrored(layout.image()) : layout.image());
                const std::string file = std::string("p.") + format.name;
                EXPECT_TRUE(runs(bench, "srec_cmp " + file + ' ' + format.reader + " expected -binary -offset " +
                                            std::to_string(layout.lowest())))
                    << line << ": " << bench.read("out");
                const std::string target = std::string("objcopy -I ") + format.target + " -O binary ";
                EXPECT_TRUE(format.target[0] == '\0' || runs(bench, target + file + " back && cmp back expected"))
                    << line << ": " << bench.read("out");
            }
        }
    }
}

/// Lowest address and end of the loaded parts, as readelf tells them.
bool rangeByReadelf(const Workbench& bench, std::uint64_t& lowest, std::uint64_t& highest) {
    lowest = ~std::uint64_t{0};
    highest = 0;
    const bool isRead = runs(bench, "readelf -lW a.elf | awk '$1 == \"LOAD\" && $5 !~ /^0x0+$/ { print $4, $5 }'");
    std::istringstream fields(bench.read("out"));
    std::uint64_t address = 0;
    std::uint64_t size = 0;
    while (fields >> std::hex >> address >> size) {
        lowest = std::min(lowest, address);
        highest = std::max(highest, address + size);
    }
    return isRead && highest != 0;
}

TEST(Independent, LinkedProgramsHaveTheRangeThatReadelfTells) {
    Workbench bench;
    NEEDS(bench, "gcc");
    NEEDS(bench, "readelf");
    bench.write("a.c", "int data[100] = {1}; int cleared[1000]; void _start(void) { data[1] = cleared[2]; }\n");
    bench.write("rom.ld",
                "SECTIONS { . = 0x8000; .text : { *(.text*) } .ram 0x20000000 : AT(0x9000) { *(.data*) }\n"
                ".bss (NOLOAD) : { *(.bss*) *(COMMON) } /DISCARD/ : { *(.note*) *(.comment) *(.eh_frame*) } }\n");
    const char* const builds[] = {
        "gcc -nostdlib -static -no-pie a.c -o a.elf",
        "gcc -nostdlib -static -no-pie -Wl,-Ttext=0x100000,-Tdata=0x40000000 a.c -o a.elf",
        "gcc -nostdlib -static -no-pie -Wl,--build-id=none,-T,rom.ld a.c -o a.elf",
        "gcc -c a.c -fno-pic -o a.o && objcopy -O elf32-i386 a.o b.o && ld -m elf_i386 -T rom.ld b.o -o a.elf",
    };
    int compared = 0;
    for (const char* const build : builds) {
        std::uint64_t lowest = 0;
        std::uint64_t highest = 0;
        if (!runs(bench, build) || !rangeByReadelf(bench, lowest, highest)) {
            continue;
        }
        ++compared;
        M2IUtil_BramMapping::M2IUtil_Results result{};
        const M2IUtil_Data_Utils reader((bench / "a.elf").c_str(), DUMP_BY_DEFAULT, &result);
        unsigned int first = 0;
        unsigned int last = 0;
        reader.GetProgramSectionAddressRange(&first, &last);
        EXPECT_EQ(result, M2IUtil_BramMapping::M2IUTIL_SUCCESS) << build << ": " << bench.said();
        EXPECT_EQ(first, lowest) << build;
        EXPECT_EQ(last, highest) << build;
    }
    EXPECT_GE(compared, 3) << bench.read("out");
}

}  // namespace
