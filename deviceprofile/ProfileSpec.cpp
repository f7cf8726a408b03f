#include <algorithm>
#include <exception>
#include <string>
#include <system_error>

#include "HkStr.h"
#include "ProfileConfig.h"
#include "deviceprofile/DataSearch.h"
#include "deviceprofile/FileText.h"
#include "deviceprofile/SectionReader.h"
#include "platform/HostPaths.h"
#include "s/UnitOrigin.h"

namespace fs = std::filesystem;

using DeviceProfile::pathOf;

namespace {

constexpr UnitOrigin origin{"../s/ProfileSpec", "$Revision: 1.1 $"};
constexpr const char* deviceData = "tessal.acd";

/// The ending that a kind of file has.
struct KindOfFile {
    char kind;
    const char* ending;
};
constexpr KindOfFile dataKinds[] = {{'a', ".acd"}, {'d', ".dat"}};
constexpr KindOfFile helpKinds[] = {{'t', ".txt"}, {'h', ".html"}};

/// The name with the ending of its kind, unless it has that or the kind has none.
template <std::size_t size>
std::string withEnding(const std::string& name, char kind, const KindOfFile (&kinds)[size]) {
    for (const KindOfFile& row : kinds) {
        if (row.kind == kind && HkStr::IMatch(name.c_str(), (std::string("*") + row.ending).c_str()) == 0) {
            return name + row.ending;
        }
    }
    return name;
}

bool isFile(const fs::path& path) {
    std::error_code error;
    return fs::is_regular_file(path, error);
}

/// The path of the index-th place of a file, empty when there is none.
std::string findPlace(const std::string& name, bool mustExist, int index) {
    for (const fs::path& place : DeviceProfile::placesOf(name)) {
        if ((!mustExist || isFile(place)) && index-- == 0) {
            return place.u8string();
        }
    }
    return {};
}

/// A new text for the caller, null for an empty one.
char* handOut(const std::string& text) {
    return text.empty() ? nullptr : HkStr::Dup(text.c_str());
}

/// The files of a directory whose names match, sorted.
std::vector<std::string> matchingFiles(const fs::path& directory, const char* pattern) {
    std::vector<std::string> files;
    std::error_code error;
    for (fs::directory_iterator entry(directory, error), end; !error && entry != end; entry.increment(error)) {
        try {
            if (HkStr::IMatch(entry->path().filename().u8string().c_str(), pattern) != 0 && isFile(entry->path())) {
                files.push_back(entry->path().u8string());
            }
        } catch (const fs::filesystem_error&) {
            continue;  // a name that cannot be written in UTF-8
        }
    }
    std::sort(files.begin(), files.end());
    return files;
}

bool isProfileName(std::string_view name) {
    const auto isAllowed = [](char ch) {
        return static_cast<unsigned char>(ch) >= ' ' && ch != '\x7F' && ch != '[' && ch != ']';
    };
    return !name.empty() && name.front() != ' ' && name.back() != ' ' &&
           std::all_of(name.begin(), name.end(), isAllowed);
}

}  // namespace

ProfileSpec::~ProfileSpec() = default;

void ProfileSpec::setName(const char* name) {
    m_profile.reset(HkStr::Len(name) != 0 ? HkStr::Dup(name) : nullptr);
}

unsigned char ProfileSpec::isvalidprofilename(const char* name, unsigned char report) {
    if (isProfileName(name != nullptr ? name : "")) {
        return 1;
    }
    if (report != 0) {
        origin.report().issueInfo("\"%s\" cannot be the name of a device profile.\n", name != nullptr ? name : "");
    }
    return 0;
}

unsigned char ProfileSpec::isunsupported() const {
    if (get_profile() == nullptr) {
        return 0;
    }
    DeviceProfile::FileText text = DeviceProfile::openDataFile(deviceData, false);
    const std::vector<std::string_view> known = DeviceProfile::listSections(text);
    return std::find(known.begin(), known.end(), get_profile()) == known.end() ? 1 : 0;
}

char* ProfileSpec::getdatafilename(char kind, const char* name, unsigned char mustExist, int index) const {
    return handOut(GetDatafileName(kind, name, mustExist != 0, index).c_str());
}

HkString ProfileSpec::GetDatafileName(char kind, const char* name, bool mustExist, int index) const {
    const char* const stem = name != nullptr ? name : get_profile();
    return HkStr::Len(stem) != 0 ? findPlace(withEnding(stem, kind, dataKinds), mustExist, index).c_str() : "";
}

std::unique_ptr<std::vector<HkString>> ProfileSpec::getdatafiles(const HkString& pattern) const {
    auto files = std::make_unique<std::vector<HkString>>();
    for (const std::string& directory : DeviceProfile::searchPath().directories) {
        for (const std::string& file : matchingFiles(pathOf(directory), pattern)) {
            files->emplace_back(file.c_str());
        }
    }
    return files;
}

char* ProfileSpec::gethelpfilename(char kind, const char* name, unsigned char mustExist, int index) const {
    const char* const stem = name != nullptr ? name : get_profile();
    return HkStr::Len(stem) != 0 ? handOut(findPlace(withEnding(stem, kind, helpKinds), mustExist != 0, index))
                                 : nullptr;
}

char* ProfileSpec::getexecfilename(char kind, const char* name, unsigned char mustExist) const {
    const fs::path prefix = DeviceProfile::installationPrefix();
    if (HkStr::Len(name) == 0 || prefix.empty()) {
        return nullptr;
    }
    const KindOfFile kinds[] = {{'x', platform::programEnding}};
    const fs::path program = prefix / "bin" / pathOf(withEnding(name, kind, kinds));
    return mustExist == 0 || isFile(program) ? handOut(program.u8string()) : nullptr;
}

char* ProfileSpec::getdllfilename(const char* name) const {
    const fs::path directory = pathOf(platform::libraryFile()).parent_path();
    if (HkStr::Len(name) == 0 || directory.empty()) {
        return nullptr;
    }
    return handOut(
        (directory / pathOf(std::string(platform::libraryPrefix) + name + platform::libraryEnding)).u8string());
}
