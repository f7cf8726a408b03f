// What the generator writes, read back by programs that nobody here wrote; what linkers write, read here.

#include <gtest/gtest.h>
#include <sys/wait.h>

#include <algorithm>
#include <cstdlib>
#include <sstream>

#include "hex/HexModel.h"
#include "images/Workbench.h"

namespace {

/// Runs a command line in a directory, its output going to the file "out" there; true when it succeeds.
bool runs(const Workbench& bench, const std::string& command) {
    const int status = std::system(("cd " + bench.path() + " && ( " + command + " ) > out 2>&1").c_str());
    return WIFEXITED(status) && WEXITSTATUS(status) == 0;
}

#define NEEDS(bench, programs)                          \
    if (!runs(bench, "type " programs)) {               \
        GTEST_SKIP() << programs " are not both there"; \
    }

/// The data files "a", 3 bytes short of 200 KiB, and "b" of 300 bytes.
const std::string a = noise(200 * 1024 - 3);
const std::string b = noise(300, 7);

struct Layout {
    const char* arguments;
    std::uint64_t a;
    std::uint64_t b;
};

const Layout layouts[] = {
    {"-up 0 -data @a -up 40000 -data @b", 0, 0x40000},
    {"-up FFF1 -data @a -up FF -data @b", 0xFFF1, 0xFF},
    {"-up 12FF0003 -data @a -up 13123456 -data @b", 0x12FF0003, 0x13123456},
};

/// The content of the PROM from the lowest address up, computed as plainly as can be.
std::string imageOf(const Layout& layout, bool swapped) {
    const std::uint64_t lowest = std::min(layout.a, layout.b);
    std::string image(std::max(layout.a + a.size(), layout.b + b.size()) - lowest, '\xFF');
    image.replace(layout.a - lowest, a.size(), a).replace(layout.b - lowest, b.size(), b);
    swapped ? void(std::transform(image.begin(), image.end(), image.begin(), HexModel::mirrored)) : void();
    return image;
}

TEST(Independent, RecordFilesComeBackAsTheDataTheyWereMadeOf) {
    Workbench bench;
    NEEDS(bench, "srec_cat srec_cmp");
    bench.write("a", a);
    bench.write("b", b);
    const std::pair<const char*, const char*> formats[] = {
        {"mcs", "-intel"}, {"exo", "-motorola"}, {"tek", "-tektronix-extended"}};
    for (const Layout& layout : layouts) {
        for (const auto& [format, reader] : formats) {
            for (const bool swapped : {false, true}) {
                const std::string line = std::string("-generic -output p -fillValue FF -format ") + format +
                                         (swapped ? " " : " -disableswap ") + layout.arguments;
                ASSERT_TRUE(bench.generate(line)) << bench.said();
                bench.write("expected", imageOf(layout, swapped));
                EXPECT_TRUE(runs(bench, std::string("srec_cmp p.") + format + ' ' + reader +
                                            " expected -binary -offset " +
                                            std::to_string(std::min(layout.a, layout.b))))
                    << line << ": " << bench.read("out");
            }
        }
    }
}

TEST(Independent, LinkedProgramsHaveTheRangeThatReadelfTells) {
    Workbench bench;
    NEEDS(bench, "gcc readelf");
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
    // Address and size of each loaded part, and lowest address and end of all of them.
    const std::string parts = "readelf -lW a.elf | awk '$1 == \"LOAD\" && $5 !~ /^0x0+$/ { print $4, $5 }'";
    int compared = 0;
    for (const char* const build : builds) {
        if (!runs(bench, build) || !runs(bench, parts)) {
            continue;
        }
        std::uint64_t lowest = ~std::uint64_t{0};
        std::uint64_t highest = 0;
        std::istringstream fields(bench.read("out"));
        for (std::uint64_t address = 0, size = 0; fields >> std::hex >> address >> size;) {
            lowest = std::min(lowest, address);
            highest = std::max(highest, address + size);
        }
        compared += highest != 0 ? 1 : 0;
        const SectionRange range(bench / "a.elf");
        EXPECT_EQ(range.result, M2IUtil_BramMapping::M2IUTIL_SUCCESS) << build << ": " << bench.said();
        EXPECT_EQ(range.lowest, lowest) << build;
        EXPECT_EQ(range.highest, highest) << build;
    }
    EXPECT_GE(compared, 3) << bench.read("out");
}

}  // namespace
