#include "hostkit/CmdFormat.h"

#include <algorithm>
#include <mutex>
#include <unordered_map>

#include "HkStr.h"

namespace HostKit::cmd {
namespace {

/// Compares the token in lower case with a text that is so already; a proper beginning is the lesser.
int compareFolded(std::string_view token, std::string_view folded) {
    const std::size_t length = std::min(token.size(), folded.size());
    for (std::size_t i = 0; i < length; ++i) {
        const int difference =
            static_cast<unsigned char>(HkStr::ToLower(token[i])) - static_cast<unsigned char>(folded[i]);
        if (difference != 0) {
            return difference;
        }
    }
    return token.size() == folded.size() ? 0 : (token.size() < folded.size() ? -1 : 1);
}

std::vector<Name>::const_iterator lowerBound(const std::vector<Name>& names, std::string_view token) {
    return std::lower_bound(names.begin(), names.end(), token, [](const Name& name, std::string_view wanted) {
        return compareFolded(wanted, name.folded) > 0;
    });
}

/// Whether the token is a beginning of the name.
bool begins(std::string_view token, const Name& name) {
    return token.size() <= name.folded.size() &&
           compareFolded(token, std::string_view(name.folded).substr(0, token.size())) == 0;
}

std::shared_ptr<const Format> compileAnew(std::string_view text) {
    auto format = std::make_shared<Format>();
    format->text = text;
    readFormat(*format);
    return format;
}

// Formats come from a table of commands, so there are few; what exceeds these bounds is compiled at each use.
constexpr std::size_t cachedFormats = 256;
constexpr std::size_t cachedLength = 16384;

struct Cache {
    std::mutex mutex;
    std::unordered_map<std::string_view, std::shared_ptr<const Format>> formats;  // each key views its format's text
};

Cache& cache() {
    static Cache& instance = *new Cache;  // never destroyed: parsers may be built until the process ends
    return instance;
}

}  // namespace

int Format::find(std::string_view name) const {
    const auto found = lowerBound(names, name);
    return found != names.end() && compareFolded(name, found->folded) == 0 ? found->rule : -1;
}

Match Format::findAbbreviated(std::string_view token) const {
    Match match;
    if (token.size() < 2) {
        return match;
    }
    for (auto name = lowerBound(names, token); name != names.end() && begins(token, *name); ++name) {
        if (match.rule >= 0 && match.rule != name->rule) {
            return {-1, true};
        }
        match.rule = name->rule;
    }
    return match;
}

std::shared_ptr<const Format> compile(const char* text) {
    const std::string_view key = text != nullptr ? text : "";
    if (key.size() > cachedLength) {
        return compileAnew(key);
    }
    Cache& known = cache();
    const std::lock_guard<std::mutex> guard(known.mutex);
    const auto found = known.formats.find(key);
    if (found != known.formats.end()) {
        return found->second;
    }
    if (known.formats.size() >= cachedFormats) {
        known.formats.clear();
    }
    std::shared_ptr<const Format> format = compileAnew(key);
    known.formats.emplace(format->text, format);
    return format;
}

}  // namespace HostKit::cmd
