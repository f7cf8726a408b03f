#include "imagetools/PromFormat.h"

#include "HkStr.h"

namespace ImageTools {
namespace {

constexpr PromFormat formats[] = {
    {"mcs", writeIntelHex, true, 44}, {"exo", writeMotorolaRecords, true, 47}, {"tek", writeTektronixHex, true, 48},
    {"hex", writeRawHex, false, 33},  {"bin", writeRawBinary, false, 16},
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
