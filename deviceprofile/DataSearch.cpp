#include "deviceprofile/DataSearch.h"

#include <algorithm>
#include <exception>
#include <mutex>
#include <string_view>
#include <system_error>

#include "DataPath.h"
#include "platform/HostPaths.h"

namespace DeviceProfile {
namespace {

namespace fs = std::filesystem;

constexpr const char* pathVariable = "TESSAL_DATA_PATH";
constexpr const char* installedData = TESSAL_INSTALLED_DATA;

struct SetPath {
    std::mutex mutex;
    std::string directories;
};

/// Never destroyed, so that data files can be opened before and after main.
SetPath& setPath() {
    static SetPath& instance = *new SetPath;
    return instance;
}

std::string currentlySet() {
    SetPath& set = setPath();
    const std::lock_guard<std::mutex> guard(set.mutex);
    return set.directories;
}

std::vector<std::string> splitList(std::string_view list) {
    std::vector<std::string> members;
    while (!list.empty()) {
        const std::size_t length = std::min(list.find(platform::listSeparator), list.size());
        if (length != 0) {
            members.emplace_back(list.substr(0, length));
        }
        list.remove_prefix(std::min(length + 1, list.size()));
    }
    return members;
}

std::vector<std::string> installedDirectories() {
    const fs::path prefix = installationPrefix();
    if (prefix.empty()) {
        return {};
    }
    return {(prefix / installedData).lexically_normal().u8string()};
}

}  // namespace

void setDataPath(const char* directories) {
    SetPath& set = setPath();
    const std::lock_guard<std::mutex> guard(set.mutex);
    set.directories = directories != nullptr ? directories : "";
}

std::string SearchPath::text() const {
    std::string list;
    for (const std::string& directory : directories) {
        list += (list.empty() ? "" : std::string(1, platform::listSeparator)) + directory;
    }
    return list;
}

SearchPath searchPath() {
    if (auto directories = splitList(currentlySet()); !directories.empty()) {
        return {"setDataPath", std::move(directories)};
    }
    if (auto directories = splitList(platform::environmentValue(pathVariable)); !directories.empty()) {
        return {pathVariable, std::move(directories)};
    }
    return {"the installation", installedDirectories()};
}

fs::path pathOf(const std::string& utf8) {
    try {
        return fs::u8path(utf8);
    } catch (const std::exception&) {
        return {};
    }
}

std::vector<fs::path> placesOf(const std::string& name) {
    const fs::path file = pathOf(name);
    if (file.empty()) {
        return {};
    }
    if (file.is_absolute()) {
        return {file};
    }
    std::vector<fs::path> places;
    for (const std::string& directory : searchPath().directories) {
        places.push_back(pathOf(directory) / file);
    }
    return places;
}

fs::path installationPrefix() {
    // The library lies in <prefix>/bin, <prefix>/lib or <prefix>/lib/<architecture>.
    const fs::path directory = pathOf(platform::libraryFile()).parent_path();
    const fs::path near = directory.parent_path();
    const fs::path far = near.parent_path();
    std::error_code error;
    return !fs::is_directory(near / installedData, error) && fs::is_directory(far / installedData, error) ? far : near;
}

}  // namespace DeviceProfile
