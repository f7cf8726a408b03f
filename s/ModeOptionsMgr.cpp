#include "ModeOptionsMgr.h"

#include <iterator>
#include <utility>

#include "s/OptionTable.h"

namespace {

constexpr OptionRow rows[] = {
#define TESSAL_ROW(name, kind, dashValue, groupSize) {"MODE_OPTIONS/" #name, OptionKind::kind, dashValue, groupSize},
    TESSAL_MODE_OPTIONS(TESSAL_ROW)
#undef TESSAL_ROW
};
static_assert(std::size(rows) == 20, "callers pass row numbers");

constexpr OptionRange cfGenerateRange{0, 3};
constexpr OptionRange mpmGenerateRange{4, 8};
constexpr OptionRange pffGenerateRange{9, 18};

}  // namespace

ModeOptionsMgr::ModeOptionsMgr() {
    init_attributes();
    init_options();
}

HkString ModeOptionsMgr::getNumberOfOptionsText() {
    return "NumberOfModeOptions";
}

void ModeOptionsMgr::init_attributes() {
    appendDescriptions(rows, m_attributes);
}

void ModeOptionsMgr::init_options() {
    appendRows(m_attributes);
}

HkString ModeOptionsMgr::getAttribute(tESSALNS::MODE_OPTION option) const {
    return keyOf(m_attributes, option);
}

bool ModeOptionsMgr::isEnabled(tESSALNS::MODE_OPTION option) const {
    return isRowEnabled(m_attributes, option);
}

bool ModeOptionsMgr::setEnable(tESSALNS::MODE_OPTION option, bool enabled) {
    return enableRow(m_attributes, option, enabled);
}

bool ModeOptionsMgr::setOption(tESSALNS::MODE_OPTION option, const char* value) {
    return writeText(m_attributes, option, value);
}

bool ModeOptionsMgr::setOption(tESSALNS::MODE_OPTION option, HkString value) {
    return writeText(m_attributes, option, std::move(value));
}

bool ModeOptionsMgr::setOption(tESSALNS::MODE_OPTION option, bool value) {
    return writeSwitch(m_attributes, option, value);
}

void ModeOptionsMgr::commit_options() {}

std::vector<HkString> ModeOptionsMgr::getCFGenerateOptions() const {
    return texts(m_attributes, cfGenerateRange.first, cfGenerateRange.last);
}

std::vector<HkString> ModeOptionsMgr::getMPMGenerateOptions() const {
    return texts(m_attributes, mpmGenerateRange.first, mpmGenerateRange.last);
}

std::vector<HkString> ModeOptionsMgr::getPFFGenerateOptions() const {
    return texts(m_attributes, pffGenerateRange.first, pffGenerateRange.last);
}

void ModeOptionsMgr::clearCFGenerateOptions() {
    clearOptions(cfGenerateRange.first, cfGenerateRange.last);
}

void ModeOptionsMgr::clearMPMGenerateOptions() {
    clearOptions(mpmGenerateRange.first, mpmGenerateRange.last);
}

void ModeOptionsMgr::clearPFFGenerateOptions() {
    clearOptions(pffGenerateRange.first, pffGenerateRange.last);
}

void ModeOptionsMgr::clearAllOptions() {
    U_OptionsMgr::clearAllOptions();
    commit_options();
}
