// The catalogue half of PromUtility.

#include <algorithm>
#include <iterator>
#include <optional>

#include "HkStr.h"
#include "ProfileConfig.h"
#include "PromUtility.h"
#include "TessalException.h"
#include "deviceprofile/PartTable.h"
#include "s/PromUtilityOrigin.h"

namespace {

using DeviceProfile::PartTable;
using DeviceProfile::ProfileConfig;
using PartList = std::vector<promPartAndSizePair>;

struct Catalogue {
    bool isRead = false;
    PartList standard;
    PartList extended;
};

/// Made at the first use and never destroyed, so that it serves other units before and behind main.
Catalogue& catalogue() {
    static Catalogue& instance = *new Catalogue;
    return instance;
}

void readParts(const char* dataFile, ProfileConfig& selection, PartList& parts) {
    PartTable table(dataFile, selection);
    for (short row = 0;; ++row) {
        const HkString name(table.name(row));
        if (name.IsEmpty()) {
            return;
        }
        parts.push_back({name, HkString(table.size(row))});
    }
}

constexpr int notListed = -1;

/// The size of the first row of that name; none where there is no such row.
std::optional<int> findSize(const char* dataFile, ProfileConfig& selection, const char* part) {
    PartTable table(dataFile, selection);
    for (short row = 0; const char* const name = table.name(row); ++row) {
        if (HkStr::ICompare(name, part) == 0) {
            const char* const size = table.size(row);
            if (size == nullptr) {
                promUtilityOrigin.raise<OutOfRangeException>();
            }
            return HkStr::AToL(size);
        }
    }
    return std::nullopt;
}

bool matches(const char* name, const char* pattern) {
    return HkStr::IMatch(name, pattern) != 0;
}

struct Family {
    const char* name;
    bool (*holds)(const char* part);
};

// The families overlap: a part may belong to several, or to none.
constexpr Family families[] = {
    {"legacy", [](const char* part) { return matches(part, "zq73*"); }},
    {"zqr", [](const char* part) { return matches(part, "zqr*"); }},
    {"version", [](const char* part) { return matches(part, "zqr*p"); }},
    {"bpi", [](const char* part) { return matches(part, "zqr*x"); }},
    {"parallel",
     [](const char* part) { return !matches(part, "zq*") && (matches(part, "*m") || matches(part, "*k")); }},
};

PartList filterParts(const PartList& parts, const char* familyName) {
    PartList result;
    for (const Family& family : families) {
        if (HkStr::ICompare(family.name, familyName) == 0) {
            std::copy_if(parts.begin(), parts.end(), std::back_inserter(result),
                         [&family](const promPartAndSizePair& part) { return family.holds(part.partName); });
        }
    }
    return result;
}

}  // namespace

bool PromUtility::readPromList() {
    Catalogue& lists = catalogue();
    if (!lists.isRead) {
        lists.isRead = true;
        ProfileConfig selection("base", 1, ProfilePartBound);
        readParts("proms.acd", selection, lists.standard);
        readParts("tessal.acd", selection, lists.extended);
    }
    return true;
}

std::vector<promPartAndSizePair> PromUtility::GetPromList() {
    readPromList();
    return catalogue().standard;
}

std::vector<promPartAndSizePair> PromUtility::GetExtendedPromList() {
    readPromList();
    return catalogue().extended;
}

std::vector<promPartAndSizePair> PromUtility::GetSpecificPromList(const char* family) {
    readPromList();
    return filterParts(catalogue().standard, family);
}

int PromUtility::GetPromSizeByName(const char* part) {
    ProfileConfig selection("base", 1, ProfilePartUnbound);
    return findSize("proms.dat", selection, part).value_or(notListed);
}

int PromUtility::GetExtendedPromSizeByName(const char* part) {
    ProfileConfig selection("base", 1, ProfilePartUnbound);
    const std::optional<int> size = findSize("proms.acd", selection, part);
    return size ? *size : findSize("tessal.acd", selection, part).value_or(notListed);
}
