#include "hostkit/CmdValue.h"

#include <algorithm>
#include <limits>

#include "HkStr.h"

namespace HostKit::cmd {
namespace {

constexpr std::uint64_t maximum = std::numeric_limits<std::uint64_t>::max();

/// The value of a digit of any base up to 16, 16 when it is none.
unsigned digitValue(char ch) {
    const char lower = HkStr::ToLower(ch);
    if (lower >= '0' && lower <= '9') {
        return static_cast<unsigned>(lower - '0');
    }
    return lower >= 'a' && lower <= 'f' ? static_cast<unsigned>(lower - 'a') + 10 : 16;
}

bool readDigits(std::string_view digits, unsigned base, std::uint64_t& number) {
    number = 0;
    for (const char ch : digits) {
        const unsigned digit = digitValue(ch);
        if (digit >= base || number > (maximum - digit) / base) {
            return false;
        }
        number = number * base + digit;
    }
    return !digits.empty();
}

bool takeHexPrefix(std::string_view& text) {
    const bool found = text.size() > 2 && text[0] == '0' && (text[1] == 'x' || text[1] == 'X');
    text.remove_prefix(found ? 2 : 0);
    return found;
}

bool isIn(const Value& value, std::int64_t number) {
    return number >= value.low && number <= value.high;
}

bool fitsInteger(const Value& value, std::string_view text) {
    std::int64_t number = 0;
    return readInteger(text, number) && isIn(value, number);
}

bool fitsHex(const Value& value, std::string_view text) {
    takeHexPrefix(text);
    return !text.empty() && isIn(value, static_cast<std::int64_t>(text.size())) &&
           std::all_of(text.begin(), text.end(), [](char ch) { return digitValue(ch) < 16; });
}

const Member* findMember(const Value& value, std::string_view name) {
    const auto found = std::find_if(value.members.begin(), value.members.end(),
                                    [name](const Member& member) { return equalFolded(member.name, name); });
    return found != value.members.end() ? &*found : nullptr;
}

/// Takes the next word of a group, up to a blank, off the text.
std::string_view takeWord(std::string_view& text) {
    text.remove_prefix(std::min(text.find_first_not_of(' '), text.size()));
    const std::string_view word = text.substr(0, text.find(' '));
    text.remove_prefix(word.size());
    return word;
}

std::string join(const std::vector<std::string>& words, const char* separator) {
    std::string joined;
    for (const std::string& word : words) {
        joined += joined.empty() ? "" : separator;
        joined += word;
    }
    return joined;
}

/// " from 1 to 255", with @p unit behind the numbers; empty where there are no bounds.
std::string bounds(const Value& value, const char* from, const char* unit) {
    const bool isLow = value.low > 1 || (value.low != std::numeric_limits<std::int64_t>::min() && *unit == '\0');
    const bool isHigh = value.high != std::numeric_limits<std::int64_t>::max();
    const std::string low = std::to_string(value.low);
    const std::string high = std::to_string(value.high);
    if (isLow && isHigh && value.low == value.high) {
        return " of " + low + unit;
    }
    if (isLow && isHigh) {
        return from + low + " to " + high + unit;
    }
    if (isHigh) {
        return " of at most " + high + unit;
    }
    return isLow ? " of at least " + low + unit : std::string();
}

std::string groupExpectation(const Value& value) {
    std::string text = "one text of " + join(value.choices, "|");
    for (const Member& member : value.members) {
        text += " [" + member.name + (member.hasText ? ":<text>]" : "]");
    }
    return text;
}

}  // namespace

bool equalFolded(std::string_view a, std::string_view b) {
    return a.size() == b.size() && std::equal(a.begin(), a.end(), b.begin(),
                                              [](char x, char y) { return HkStr::ToLower(x) == HkStr::ToLower(y); });
}

bool readInteger(std::string_view text, std::int64_t& number) {
    const bool negative = !text.empty() && text[0] == '-';
    if (negative || (!text.empty() && text[0] == '+')) {
        text.remove_prefix(1);
    }
    std::uint64_t magnitude = 0;
    const unsigned base = takeHexPrefix(text) ? 16 : 10;
    constexpr std::uint64_t positiveLimit = maximum / 2;
    if (!readDigits(text, base, magnitude) || magnitude > positiveLimit + (negative ? 1 : 0)) {
        return false;
    }
    number = static_cast<std::int64_t>(negative ? 0 - magnitude : magnitude);
    return true;
}

bool readHex(std::string_view text, std::uint64_t& number) {
    takeHexPrefix(text);
    return readDigits(text, 16, number);
}

const std::string* findChoice(const std::vector<std::string>& choices, std::string_view text) {
    const auto found = std::find_if(choices.begin(), choices.end(),
                                    [text](const std::string& choice) { return equalFolded(choice, text); });
    return found != choices.end() ? &*found : nullptr;
}

bool splitGroup(const Value& value, std::string_view text, std::vector<GroupWord>& words) {
    const std::string* const leader = findChoice(value.choices, takeWord(text));
    if (leader == nullptr) {
        return false;
    }
    words.push_back({*leader, {}});
    while (text.find_first_not_of(' ') != std::string_view::npos) {
        const std::string_view word = takeWord(text);
        const std::size_t colon = word.find(':');
        const Member* const member = findMember(value, word.substr(0, colon));
        if (member == nullptr || member->hasText != (colon != std::string_view::npos)) {
            return false;
        }
        words.push_back({member->name, {}});
        if (member->hasText) {
            // The text goes on to the end of the value, blanks included.
            const char* const begin = word.data() + colon + 1;
            words.back().text = {begin, static_cast<std::size_t>(text.data() + text.size() - begin)};
            return true;
        }
    }
    return true;
}

bool fits(const Value& value, std::string_view text) {
    switch (value.type) {
        case Type::Integer:
            return fitsInteger(value, text);
        case Type::Hex:
            return fitsHex(value, text);
        case Type::File:
            return !text.empty();
        case Type::Choice:
            return findChoice(value.choices, text) != nullptr;
        case Type::Group: {
            std::vector<GroupWord> words;
            return splitGroup(value, text, words);
        }
        case Type::Text:
            return isIn(value, static_cast<std::int64_t>(text.size()));
        case Type::None:
            break;
    }
    return false;
}

std::string expectation(const Value& value) {
    switch (value.type) {
        case Type::Integer:
            return "an integer" + bounds(value, " from ", "");
        case Type::Hex:
            return "a hexadecimal number" + bounds(value, " of ", value.high == 1 ? " digit" : " digits");
        case Type::File:
            return "a file name";
        case Type::Choice:
            return "one of " + join(value.choices, ", ");
        case Type::Group:
            return groupExpectation(value);
        case Type::Text:
            return "a text" + bounds(value, " of ", value.high == 1 ? " character" : " characters");
        case Type::None:
            break;
    }
    return {};
}

}  // namespace HostKit::cmd
