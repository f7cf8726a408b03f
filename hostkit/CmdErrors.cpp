#include "hostkit/CmdErrors.h"

#include <algorithm>
#include <cstdio>

#include "HkStr.h"

namespace HostKit::cmd {
namespace {

struct Text {
    Problem problem;
    const char* pattern;
};

constexpr Text texts[] = {
    {Problem::MalformedFormat, "the argument format is malformed at character {number}: {expected}"},
    {Problem::NoCommand, "there is no command word"},
    {Problem::NullArgument, "argument {number} is null"},
    {Problem::UnknownSwitch, "unknown switch {argument}{nearest}"},
    {Problem::AmbiguousSwitch, "switch {argument} is short for {expected}: write more of it"},
    {Problem::UnexpectedArgument, "unexpected argument {argument}{nearest}"},
    {Problem::MissingValue, "{name} needs {expected}, and there is none"},
    {Problem::BadValue, "{name} needs {expected}, not {argument}{nearest}"},
    {Problem::NoValueTaken, "{name} takes no value, but was given {argument}"},
    {Problem::GivenTwice, "{name} is given more than once"},
    {Problem::Missing, "{name} is missing{expected}"},
    {Problem::NotTogether, "{name} and {expected} exclude each other"},
    {Problem::OneMissing, "one of {expected} is needed"},
    {Problem::MoreErrors, "and {number} more errors"},
};

constexpr bool areInOrder() {
    std::size_t index = 0;
    for (const Text& text : texts) {
        if (static_cast<std::size_t>(text.problem) != index++) {
            return false;
        }
    }
    return index == static_cast<std::size_t>(Problem::MoreErrors) + 1;
}
static_assert(areInOrder(), "one text for each problem, in the order of the enum");

std::string fill(std::string_view place, const Details& details) {
    if (place == "argument") {
        return '"' + printable(details.argument) + '"';
    }
    if (place == "name") {
        return details.name;
    }
    if (place == "expected") {
        return details.expected;
    }
    if (place == "number") {
        return std::to_string(details.number);
    }
    return details.nearest.empty() ? std::string() : "; did you mean " + details.nearest + "?";
}

bool isContinuationByte(char ch) {
    return (static_cast<unsigned char>(ch) & 0xC0U) == 0x80U;
}

constexpr std::size_t longestShown = 80;
constexpr std::size_t longestCompared = 64;

}  // namespace

std::string errorText(Problem problem, const Details& details) {
    std::string_view pattern = texts[static_cast<std::size_t>(problem)].pattern;
    std::string text;
    for (std::size_t open = pattern.find('{'); open != std::string_view::npos; open = pattern.find('{')) {
        const std::size_t close = pattern.find('}');
        text += pattern.substr(0, open);
        text += fill(pattern.substr(open + 1, close - open - 1), details);
        pattern.remove_prefix(close + 1);
    }
    return text.append(pattern);
}

std::string printable(std::string_view text) {
    std::size_t length = std::min(text.size(), longestShown);
    while (length < text.size() && length > 0 && isContinuationByte(text[length])) {
        --length;  // no character is cut in two
    }
    std::string result;
    for (const char ch : text.substr(0, length)) {
        if (static_cast<unsigned char>(ch) < 0x20 || ch == 0x7F) {
            char escape[8];
            std::snprintf(escape, sizeof escape, "\\x%02X", static_cast<unsigned>(static_cast<unsigned char>(ch)));
            result += escape;
        } else {
            result += ch;
        }
    }
    return result + (length < text.size() ? "..." : "");
}

std::size_t editDistance(std::string_view a, std::string_view b, std::size_t limit) {
    const std::size_t difference = a.size() > b.size() ? a.size() - b.size() : b.size() - a.size();
    if (difference > limit || std::max(a.size(), b.size()) > longestCompared) {
        return limit + 1;
    }
    std::size_t rows[3][longestCompared + 1];
    std::size_t* before = rows[0];  // the row two characters of a back
    std::size_t* last = rows[1];
    std::size_t* next = rows[2];
    for (std::size_t j = 0; j <= b.size(); ++j) {
        last[j] = j;
    }
    for (std::size_t i = 1; i <= a.size(); ++i) {
        next[0] = i;
        for (std::size_t j = 1; j <= b.size(); ++j) {
            const char ca = HkStr::ToLower(a[i - 1]);
            const char cb = HkStr::ToLower(b[j - 1]);
            next[j] = std::min({last[j] + 1, next[j - 1] + 1, last[j - 1] + (ca == cb ? 0 : 1)});
            if (i > 1 && j > 1 && ca == HkStr::ToLower(b[j - 2]) && cb == HkStr::ToLower(a[i - 2])) {
                next[j] = std::min(next[j], before[j - 2] + 1);
            }
        }
        std::size_t* const free = before;
        before = last;
        last = next;
        next = free;
    }
    return last[b.size()];
}

NearestWord::NearestWord(std::string_view wanted) : m_wanted(wanted), m_limit(wanted.size() / 3) {}

void NearestWord::consider(std::string_view candidate) {
    const std::size_t distance = editDistance(m_wanted, candidate, m_limit);
    if (distance <= m_limit && (m_word.empty() || distance < m_limit)) {
        m_word = candidate;
        m_limit = distance;
    }
}

}  // namespace HostKit::cmd
