// The PROM file generator as a program of its own: tessal_prom -generic -output boot -data boot.bin

#include <TessalUtility.h>

#include <cstdio>
#include <string>

int main(int argc, char** argv) {
    const char* const format = IF_IMAGEGEN::getcmdformat();
    const std::string first = argc > 1 ? argv[1] : "--help";
    if (first == "-h" || first == "--help") {
        std::fputs(HkCmdArgs::help("tessal_prom", format).c_str(), stdout);
        return 0;
    }
    const HkCmdArgs args(argc, argv, format, nullptr, 0);
    IF_IMAGEGEN generator(&args);
    return generator.makeprom();
}
