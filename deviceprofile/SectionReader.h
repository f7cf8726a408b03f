// Takes the keys of one section out of the text of a data file.
#pragma once

#include <string_view>
#include <vector>

#include "deviceprofile/FileText.h"
#include "deviceprofile/KeyList.h"

namespace DeviceProfile {

struct LineReports {
    bool malformed;  ///< report lines that cannot be understood
    bool repeated;   ///< report keys that are set twice
};

/// Reads the whole text and gives the keys of the section. They lie in the text, which is changed: keys are moved up to
/// their values, and later lines that go on are joined.
KeyList readSection(FileText& text, std::string_view section, LineReports reports);

/// The names of the sections of the text, in the order of their first lines. They lie in the text, which is changed.
std::vector<std::string_view> listSections(FileText& text);

}  // namespace DeviceProfile
