// A pattern chooses the same texts as a plain model, which follows every way that wildcards can go at once.
#include <string>
#include <vector>

#include "CableDriver.h"
#include "HkStr.h"
#include "fuzz/Fuzz.h"

namespace {

/// Keeps, for each end of the text, whether the pattern up to here matches the text up to there.
bool matchByModel(const std::string& text, const std::string& pattern, bool hasWildcards) {
    std::vector<bool> matches(text.size() + 1, false);
    matches[0] = true;
    for (const char wanted : pattern) {
        std::vector<bool> next(text.size() + 1, false);
        const bool isAny = hasWildcards && wanted == '*';
        for (std::size_t end = 0; end <= text.size(); ++end) {
            next[end] = isAny ? matches[end] || (end > 0 && next[end - 1])
                              : end > 0 && matches[end - 1] && HkStr::ToLower(text[end - 1]) == HkStr::ToLower(wanted);
        }
        matches = next;
    }
    return matches.back();
}

}  // namespace

/// The input is a pattern and, behind its first line end, a text.
void fuzz(Input input) {
    const std::string pattern = input.line();
    const std::string text = input.text();
    const DeviceIdPattern parsed = parseDeviceIdPattern(pattern.c_str());
    const std::size_t instance = pattern[0] == '@' ? 1 : 0;
    const std::size_t literal = pattern[instance] == '\'' ? 1 : 0;
    require((parsed.m_isInstanceId != 0) == (instance != 0));
    require(matchDeviceId(text.c_str(), parsed) ==
            matchByModel(text, pattern.substr(instance + literal), literal == 0));
}
