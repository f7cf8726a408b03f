#include "ProfileKeyTable.h"

#include "HkStr.h"
#include "ProfileConfig.h"
#include "deviceprofile/CellStore.h"
#include "deviceprofile/FileText.h"

namespace {

constexpr const char* defaultProfile = "base";

const char* profileOf(const ProfilePick* pick) {
    const char* const profile = pick != nullptr ? pick->get_profile() : nullptr;
    return profile != nullptr ? profile : defaultProfile;
}

const char* textOf(const char* text) {
    return text != nullptr ? text : "";
}

}  // namespace

ProfileKeyTable::ProfileKeyTable(const char* dataFile, ProfilePick* pick, unsigned char reportAbsent,
                                 unsigned char reportMalformed, unsigned char reportRepeated)
    : m_cells(std::make_unique<CellStore>(
          DeviceProfile::openDataFile(dataFile != nullptr ? dataFile : "", reportAbsent != 0), profileOf(pick),
          DeviceProfile::LineReports{reportMalformed != 0, reportRepeated != 0})) {}

ProfileKeyTable::~ProfileKeyTable() = default;

const char* ProfileKeyTable::getstringbykey(const char* key, const char* rowSeparator, short rowIndex,
                                            const char* fieldSeparator, short fieldIndex) {
    return m_cells->cell(textOf(key), textOf(rowSeparator), rowIndex, textOf(fieldSeparator), fieldIndex);
}

int ProfileKeyTable::GetInt32ByKey(const char* key, const char* rowSeparator, short rowIndex,
                                   const char* fieldSeparator, short fieldIndex) {
    return HkStr::AToI(getstringbykey(key, rowSeparator, rowIndex, fieldSeparator, fieldIndex));
}
