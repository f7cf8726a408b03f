// What the generator writes, read back by programs that nobody here wrote; what linkers write, read here.

#include <gtest/gtest.h>
#include <sys/wait.h>

#include <algorithm>
#include <cstdlib>
#include <sstream>

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

TEST(Independent, RecordFilesComeBackAsTheDataTheyWereMadeOf) {
    Workbench bench;
    NEEDS(bench, "srec_cat srec_cmp");
    const std::string a = noise(200 * 1024 - 3);
    const std::string b = noise(300, 7);
    bench.write("a", a);
    bench.write("b", b);
    const std::tuple<const char*, std::uint64_t, std::uint64_t> layouts[] = {
        {"-up 0 -data @a -up 40000 -data @b", 0, 0x40000},
        {"-up FFF1 -data @a -up FF -data @b", 0xFFF1, 0xFF},
        {"-up 12FF0003 -data @a -up 13123456 -data @b", 0x12FF0003, 0x13123456},
    };
    const std::pair<const char*, const char*> formats[] = {
        {"mcs", "-intel"}, {"exo", "-motorola"}, {"tek", "-tektronix-extended"}};
    for (const auto& [places, placeOfA, placeOfB] : layouts) {
        const std::uint64_t lowest = std::min(placeOfA, placeOfB);
        std::string image(std::max(placeOfA + a.size(), placeOfB + b.size()) - lowest, '\xFF');
        image.replace(placeOfA - lowest, a.size(), a).replace(placeOfB - lowest, b.size(), b);
        bench.write("expected", image);
        for (const auto& [format, reader] : formats) {
            const std::string line =
                std::string("-generic -output p -fillValue FF -disableswap -format ") + format + ' ' + places;
            ASSERT_TRUE(bench.generate(line)) << bench.said();
            EXPECT_TRUE(runs(bench, std::string("srec_cmp p.") + format + ' ' + reader + " expected -binary -offset " +
                                        std::to_string(lowest)))
                << line << ": " << bench.read("out");
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
        unsigned int lowest = ~0U;
        unsigned int highest = 0;
        std::istringstream fields(bench.read("out"));
        for (unsigned int address = 0, size = 0; fields >> std::hex >> address >> size;) {
            lowest = std::min(lowest, address);
            highest = std::max(highest, address + size);
        }
        compared += highest != 0 ? 1 : 0;
        EXPECT_EQ(sectionRange(bench / "a.elf"), SectionRange(M2IUtil_BramMapping::M2IUTIL_SUCCESS, lowest, highest))
            << build << ": " << bench.said();
    }
    EXPECT_GE(compared, 3) << bench.read("out");
}

}  // namespace
