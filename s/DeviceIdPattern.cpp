#include <cstddef>

#include "CableDriver.h"
#include "HkStr.h"

DeviceIdPattern parseDeviceIdPattern(const char* text) {
    DeviceIdPattern pattern{text != nullptr ? text : "", nullptr, 0};
    if (*pattern.m_text == '@') {
        pattern.m_isInstanceId = 1;
        ++pattern.m_text;
    }
    if (*pattern.m_text == '\'') {
        ++pattern.m_text;
    } else {
        pattern.m_firstWildcard = HkStr::FindString(pattern.m_text, "*");
    }
    return pattern;
}

bool matchDeviceId(const char* text, const DeviceIdPattern& pattern) {
    if (pattern.m_firstWildcard == nullptr) {
        return HkStr::ICompare(text, pattern.m_text) == 0;
    }
    const auto head = static_cast<std::size_t>(pattern.m_firstWildcard - pattern.m_text);
    return HkStr::INCompare(text, pattern.m_text, head) == 0 &&
           HkStr::IMatch(HkStr::View(text).data() + head, pattern.m_firstWildcard) != 0;
}
