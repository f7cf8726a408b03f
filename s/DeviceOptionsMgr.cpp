#include "DeviceOptionsMgr.h"

#include <iterator>
#include <utility>

#include "s/OptionTable.h"

namespace {

constexpr OptionRow rows[] = {
#define TESSAL_ROW(name, kind, dashValue, groupSize) {"PROGRAM_OPTIONS/" #name, OptionKind::kind, dashValue, groupSize},
    TESSAL_PROGRAM_OPTIONS(TESSAL_ROW)
#undef TESSAL_ROW
};
static_assert(std::size(rows) == 105, "callers pass row numbers");

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
    m_uesSize = 0;
    appendDescriptions(rows, m_attributes);
}

void DeviceOptionsMgr::init_options() {
    appendRows(m_attributes);
}

HkString DeviceOptionsMgr::getAttribute(tESSALNS::PROGRAM_OPTION option) const {
    return keyOf(m_attributes, option);
}

bool DeviceOptionsMgr::isEnabled(tESSALNS::PROGRAM_OPTION option) const {
    return isRowEnabled(m_attributes, option);
}

bool DeviceOptionsMgr::setEnable(tESSALNS::PROGRAM_OPTION option, bool enabled) {
    return enableRow(m_attributes, option, enabled);
}

bool DeviceOptionsMgr::setOption(tESSALNS::PROGRAM_OPTION option, const char* value) {
    return writeText(m_attributes, option, value);
}

bool DeviceOptionsMgr::setOption(tESSALNS::PROGRAM_OPTION option, HkString value) {
    return writeText(m_attributes, option, std::move(value));
}

bool DeviceOptionsMgr::setOption(tESSALNS::PROGRAM_OPTION option, bool value) {
    return writeSwitch(m_attributes, option, value);
}

void DeviceOptionsMgr::commit_options() {}

std::vector<HkString> DeviceOptionsMgr::getProgramOptions() const {
    return texts(m_attributes, programRange.first, programRange.last);
}

std::vector<HkString> DeviceOptionsMgr::getEraseOptions() const {
    return texts(m_attributes, eraseRange.first, eraseRange.last);
}

std::vector<HkString> DeviceOptionsMgr::getReadbackOptions() const {
    return texts(m_attributes, readbackRange.first, readbackRange.last);
}

std::vector<HkString> DeviceOptionsMgr::getVerifyOptions() const {
    return texts(m_attributes, verifyRange.first, verifyRange.last);
}

std::vector<HkString> DeviceOptionsMgr::getCustCodeOptions() const {
    return texts(m_attributes, custCodeRange.first, custCodeRange.last);
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

void DeviceOptionsMgr::clearAllOptions() {
    U_OptionsMgr::clearAllOptions();
    commit_options();
}
