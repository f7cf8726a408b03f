// The PROM file generator as a program of its own: tessal_prom -generic -output boot -data boot.bin

#include <TessalUtility.h>

int main(int argc, char** argv) {
    const HkCmdArgs args(argc, argv, IF_IMAGEGEN::getcmdformat(), nullptr, 0);
    IF_IMAGEGEN generator(&args);
    return generator.makeprom();
}
