// The records of each format, by worked examples.

#include <gtest/gtest.h>

#include "images/Workbench.h"

namespace {

struct Case {
    const char* name;
    const char* arguments;  ///< "a" and "b" are the data files
    const char* a;
    const char* b;
    const char* file;
    const char* content;
};

const Case cases[] = {
    {"Intel hex", "-format mcs -up 100 -data @a", "21460136", "", "p.mcs",
     ":020000040000FA\n:04010000214601365D\n:00000001FF\n"},
    {"Intel hex, upper half", "-up 800FFFE -data @a", "AA55", "", "p.mcs",
     ":020000040800F2\n:02FFFE00AA5502\n:00000001FF\n"},
    {"Intel hex, across 64 KiB", "-up FFFF -data @a", "AA55", "", "p.mcs",
     ":020000040000FA\n:01FFFF00AA57\n:020000040001F9\n:0100000055AA\n:00000001FF\n"},
    {"Intel hex, rows end at multiples of 16", "-up E -data @a", "01020304", "", "p.mcs",
     ":020000040000FA\n:02000E000102ED\n:020010000304E7\n:00000001FF\n"},
    {"S1", "-format exo -active HDR -up 1000 -data @a", "01020304", "", "p.exo",
     "S00600004844521B\nS107100001020304DE\nS5030001FB\nS9030000FC\n"},
    {"S2", "-format exo -active HDR -up 123456 -data @a", "DEAD", "", "p.exo",
     "S00600004844521B\nS206123456DEADD2\nS5030001FB\nS804000000FB\n"},
    {"S3", "-format exo -active HDR -up 80001000 -data @a", "BEEF", "", "p.exo",
     "S00600004844521B\nS30780001000BEEFBB\nS5030001FB\nS70500000000FA\n"},
    {"S1 up to its last address", "-format exo -active HDR -up FFFF -data @a", "00", "", "p.exo",
     "S00600004844521B\nS104FFFF00FD\nS5030001FB\nS9030000FC\n"},
    {"S2 up to its last address", "-format exo -active HDR -up FFFFFF -data @a", "00", "", "p.exo",
     "S00600004844521B\nS205FFFFFF00FD\nS5030001FB\nS804000000FB\n"},
    {"Tektronix", "-format tek -up 1000 -data @a -up 80001000 -data @b", "01020304", "DEAD", "p.tek",
     "%126184100001020304\n%1264C880001000DEAD\n%0781010\n"},
    {"raw hex", "-format hex -data @a", "12A5", "", "p.hex", "12A5\n"},
    {"raw hex, gap", "-format hex -up 1000 -data @a -up 1008 -data @b", "01020304", "DEAD", "p.hex",
     "01020304FFFFFFFFDEAD\n"},
    {"raw binary, gap", "-format bin -fillValue 2E -up 1000 -data @a -up 1003 -data @b", "4142", "43", "p.bin", "AB.C"},
    {"gap in records", "-format exo -active HDR -up 0 -data @a -up 4 -data @b", "01", "02", "p.exo",
     "S00600004844521B\nS104000001FA\nS104000402F5\nS5030002FA\nS9030000FC\n"},
    {"gap in records, filled", "-format exo -active HDR -fillValue 0 -up 0 -data @a -up 4 -data @b", "01", "02",
     "p.exo", "S00600004844521B\nS104000001FA\nS1060001000000F8\nS104000402F5\nS5030003F9\nS9030000FC\n"},
    {"fill left out", "-compressed -data @a", "FFFFFFFFFFFFFFFFFFFFFFFFFFFFFFFF01", "", "p.mcs",
     ":020000040000FA\n:0100100001EE\n:00000001FF\n"},
};

TEST(Formats, RecordsAreThoseOfTheExamples) {
    for (const Case& c : cases) {
        Workbench bench;
        bench.write("a", bytes(c.a));
        bench.write("b", bytes(c.b));
        EXPECT_TRUE(bench.generate(std::string("-generic -disableswap -output p ") + c.arguments)) << bench.said();
        EXPECT_EQ(bench.read(c.file), c.content) << c.name;
    }
}

TEST(Formats, BitsOfBytesAreReversedUnlessToldOtherwise) {
    Workbench bench;
    bench.write("a", bytes("12A5"));
    EXPECT_TRUE(bench.generate("-generic -format hex -output p -data @a"));
    EXPECT_EQ(bench.read("p.hex"), "48A5\n");
}

}  // namespace
