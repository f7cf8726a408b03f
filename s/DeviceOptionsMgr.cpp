#include "DeviceOptionsMgr.h"

namespace {

using tESSALNS::OptionRange;

constexpr OptionRange programRange{0, 67};
constexpr OptionRange eraseRange{67, 81};
constexpr OptionRange readbackRange{81, 83};
constexpr OptionRange verifyRange{84, 92};
constexpr OptionRange custCodeRange{94, 102};

}  // namespace

DeviceOptionsMgr::DeviceOptionsMgr() {
    init_attributes();
    init_options();
}

HkString DeviceOptionsMgr::getNumberOfOptionsText() {
    return "NumberOfDeviceOptions";
}

void DeviceOptionsMgr::init_attributes() {
    setUESSize(0);
    addDescriptions(tESSALNS::programOptionRows);
}

std::vector<HkString> DeviceOptionsMgr::getProgramOptions() const {
    return textsOf(programRange);
}

std::vector<HkString> DeviceOptionsMgr::getEraseOptions() const {
    return textsOf(eraseRange);
}

std::vector<HkString> DeviceOptionsMgr::getReadbackOptions() const {
    return textsOf(readbackRange);
}

std::vector<HkString> DeviceOptionsMgr::getVerifyOptions() const {
    return textsOf(verifyRange);
}

std::vector<HkString> DeviceOptionsMgr::getCustCodeOptions() const {
    return textsOf(custCodeRange);
}

void DeviceOptionsMgr::clearProgramOptions() {
    clearOptions(programRange.first, programRange.last);
}

void DeviceOptionsMgr::clearEraseOptions() {
    clearOptions(eraseRange.first, eraseRange.last);
}

void DeviceOptionsMgr::clearReadbackOptions() {
    clearOptions(readbackRange.first, readbackRange.last);
}
