#include "imagetools/PromParts.h"

#include <vector>

#include "HkCmdArgs.h"
#include "HkStr.h"
#include "deviceprofile/PartTable.h"
#include "imagetools/SegmentMap.h"
#include "s/ByteTables.h"

namespace ImageTools {
namespace {

constexpr const char* dataFiles[] = {"proms.acd", "tessal.acd", "proms.dat"};

Problem sizeFromText(const char* part, const char* text, std::uint64_t& size) {
    const std::int32_t number = HkStr::AToL(text);
    if (number <= 0) {
        return "part " + std::string(part) + " has no usable size in the data files, \"" +
               std::string(HkStr::View(text)) + '"';
    }
    size = static_cast<std::uint64_t>(number);
    return {};
}

Problem unknownPart(const char* part, const std::vector<HkString>& known) {
    const char* const nearest = HkCmdArgs::nearest(part, known);
    return "unknown part \"" + std::string(part) + '"' +
           (nearest != nullptr ? "; did you mean " + std::string(nearest) + '?' : std::string()) +
           (known.empty() ? "; the data files list no parts" : "");
}

std::uint64_t unitOf(char letter) {
    switch (HkStr::ToUpper(letter)) {
        case 'K':
            return std::uint64_t{1} << 10;
        case 'M':
            return std::uint64_t{1} << 20;
        case 'G':
            return std::uint64_t{1} << 30;
        default:
            return 0;
    }
}

}  // namespace

Problem findPartSize(const char* part, std::uint64_t& size) {
    std::vector<HkString> known;
    DeviceProfile::ProfileConfig selection("base", 1, ProfilePartUnbound);
    for (const char* const dataFile : dataFiles) {
        DeviceProfile::PartTable table(dataFile, selection);
        for (short row = 0; const char* const name = table.name(row); ++row) {
            if (HkStr::ICompare(name, part) == 0) {
                return sizeFromText(name, table.size(row), size);
            }
            known.emplace_back(name);
        }
    }
    return unknownPart(part, known);
}

std::optional<std::uint64_t> parseSize(const char* text) {
    std::string_view digits = HkStr::View(text);
    const std::uint64_t named = digits.empty() ? 0 : unitOf(digits.back());
    const std::uint64_t unit = named != 0 ? named : 1;
    digits.remove_suffix(named != 0 ? 1 : 0);
    const bool isHex = digits.size() > 2 && digits[0] == '0' && (digits[1] == 'x' || digits[1] == 'X');
    digits.remove_prefix(isHex ? 2 : 0);
    const unsigned base = isHex ? 16 : 10;
    std::uint64_t value = 0;
    for (const char ch : digits) {
        const unsigned digit = ByteTables::valueOf(ch);
        value = value * base + digit;
        if (digit >= base || value > addressSpace) {
            return std::nullopt;
        }
    }
    const bool fits = value != 0 && value <= addressSpace / unit;
    return fits ? std::optional(value * unit) : std::nullopt;
}

}  // namespace ImageTools
