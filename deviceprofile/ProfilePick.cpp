#include <string>

#include "HkStr.h"
#include "ProfileConfig.h"
#include "deviceprofile/FileText.h"
#include "deviceprofile/SectionReader.h"
#include "s/UnitOrigin.h"

namespace {

constexpr UnitOrigin origin{"../s/ProfilePick", "$Revision: 1.1 $"};
constexpr const char* deviceData = "tessal.acd";

}  // namespace

ProfilePick::ProfilePick(const char* name, unsigned char flag, ProfilePartBinding binding)
    : m_flag(flag), m_binding(binding) {
    setName(name);
}

ProfilePick::~ProfilePick() = default;

unsigned char ProfilePick::set_profile(const char* name) {
    if (isvalidprofilename(name, 0) == 0) {
        return 0;
    }
    setName(name);
    return 1;
}

unsigned char ProfilePick::isvalid(unsigned char inData, unsigned char report) {
    if (isvalidprofilename(get_profile(), report) == 0) {
        return 0;
    }
    if (inData == 0 || isunsupported() == 0) {
        return 1;
    }
    if (report != 0) {
        origin.report().issueInfo("The data file %s has no section [%s].\n", deviceData, get_profile());
    }
    return 0;
}

void ProfilePick::make_list(const char* dataFile, const char* pattern, unsigned char print) {
    m_profiles.clear();
    DeviceProfile::FileText text = DeviceProfile::openDataFile(dataFile != nullptr ? dataFile : deviceData, true);
    for (const std::string_view name : DeviceProfile::listSections(text)) {
        const HkString profile(name);
        if (pattern == nullptr || HkStr::IMatch(profile, pattern) != 0) {
            m_profiles.push_back(profile);
        }
    }
    if (print != 0) {
        for (const HkString& profile : m_profiles) {
            origin.report().issueStatus("%s\n", profile.c_str());
        }
    }
}

void ProfilePick::printme(const char* title) const {
    const char* const profile = get_profile();
    origin.report().issueStatus("%s%sprofile %s, flag %d, binding %d\n", title != nullptr ? title : "",
                                title != nullptr ? ": " : "", profile != nullptr ? profile : "(none)", m_flag,
                                static_cast<int>(m_binding));
}

namespace DeviceProfile {

ProfileConfig::ProfileConfig(const char* name, unsigned char flag, ProfilePartBinding binding)
    : ProfilePick(name, flag, binding) {}

ProfileConfig::~ProfileConfig() = default;

}  // namespace DeviceProfile
