#include "ModeOptionsMgr.h"

namespace {

using tESSALNS::OptionRange;

constexpr OptionRange cfRange{0, 3};
constexpr OptionRange mpmRange{4, 8};
constexpr OptionRange pffRange{9, 18};

}  // namespace

ModeOptionsMgr::ModeOptionsMgr() {
    init_attributes();
    init_options();
}

HkString ModeOptionsMgr::getNumberOfOptionsText() {
    return "NumberOfModeOptions";
}

void ModeOptionsMgr::init_attributes() {
    addDescriptions(tESSALNS::modeOptionRows);
}

std::vector<HkString> ModeOptionsMgr::getCFGenerateOptions() const {
    return textsOf(cfRange);
}

std::vector<HkString> ModeOptionsMgr::getMPMGenerateOptions() const {
    return textsOf(mpmRange);
}

std::vector<HkString> ModeOptionsMgr::getPFFGenerateOptions() const {
    return textsOf(pffRange);
}

void ModeOptionsMgr::clearCFGenerateOptions() {
    clearOptions(cfRange.first, cfRange.last);
}

void ModeOptionsMgr::clearMPMGenerateOptions() {
    clearOptions(mpmRange.first, mpmRange.last);
}

void ModeOptionsMgr::clearPFFGenerateOptions() {
    clearOptions(pffRange.first, pffRange.last);
}
