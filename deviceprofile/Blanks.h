// What counts as blank in a data file: space and tab.
#pragma once

namespace DeviceProfile {

constexpr bool isBlank(char ch) {
    return ch == ' ' || ch == '\t';
}

/// The first character that is not blank, or @p end.
inline char* skipBlanks(char* begin, const char* end) {
    while (begin != end && isBlank(*begin)) {
        ++begin;
    }
    return begin;
}

/// Behind the last character that is not blank, or @p begin.
inline char* dropBlanks(const char* begin, char* end) {
    while (end != begin && isBlank(end[-1])) {
        --end;
    }
    return end;
}

}  // namespace DeviceProfile
