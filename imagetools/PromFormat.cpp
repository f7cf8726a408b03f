#include "imagetools/PromFormat.h"

#include "HkStr.h"

namespace ImageTools {
namespace {

constexpr PromFormat formats[] = {
    {"mcs", writeIntelHex, true}, {"exo", writeMotorolaRecords, true}, {"tek", writeTektronixHex, true},
    {"hex", writeRawHex, false},  {"bin", writeRawBinary, false},
};

}  // namespace

const PromFormat& promFormat(const char* name) {
    for (const PromFormat& format : formats) {
        if (HkStr::ICompare(format.name, name) == 0) {
            return format;
        }
    }
    return formats[0];
}

}  // namespace ImageTools
