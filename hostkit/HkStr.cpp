#include "HkStr.h"

#include <cstdarg>
#include <cstdio>
#include <cstring>
#include <limits>
#include <string>
#include <string_view>

namespace HostKit {
namespace {

const char* orEmpty(const char* text) {
    return text != nullptr ? text : "";
}

unsigned char folded(char ch) {
    return static_cast<unsigned char>(HkStr::ToLower(ch));
}

/// The format without the single `l` of its numbers, which have 32 bits here on every host. `ll` stays.
std::string withoutLong(const char* format) {
    constexpr std::string_view numbers = "diouxX";
    std::string result;
    bool isConversion = false;
    for (; *format != '\0'; ++format) {
        const bool isEnd = HkStr::ToLower(*format) >= 'a' && HkStr::ToLower(*format) <= 'z' && *format != 'l';
        const bool isSingle =
            isConversion && *format == 'l' && result.back() != 'l' && numbers.find(format[1]) != std::string_view::npos;
        if (!isSingle) {
            result += *format;
        }
        isConversion = *format == '%' ? !isConversion : isConversion && !isEnd;
    }
    return result;
}

bool isBlank(char ch) {
    return ch == ' ' || (ch >= '\t' && ch <= '\r');
}

}  // namespace

std::size_t HkStr::Len(const char* text) {
    return std::strlen(orEmpty(text));
}

char* HkStr::Copy(char* dest, const char* source) {
    return dest != nullptr ? std::strcpy(dest, orEmpty(source)) : nullptr;
}

char* HkStr::NCopy(char* dest, const char* source, std::size_t n) {
    if (dest == nullptr) {
        return nullptr;
    }
    source = orEmpty(source);
    std::size_t i = 0;
    for (; i < n && source[i] != '\0'; ++i) {
        dest[i] = source[i];
    }
    if (i < n) {
        dest[i] = '\0';
    }
    return dest;
}

char* HkStr::Cat(char* dest, const char* source) {
    return dest != nullptr ? std::strcat(dest, orEmpty(source)) : nullptr;
}

char* HkStr::NCat(char* dest, const char* source, std::size_t n) {
    return dest != nullptr ? std::strncat(dest, orEmpty(source), n) : nullptr;
}

char* HkStr::Dup(const char* text) {
    const std::size_t size = Len(text) + 1;
    return static_cast<char*>(std::memcpy(new char[size], orEmpty(text), size));
}

char* HkStr::FindChar(char* text, int ch) {
    return text != nullptr && ch != 0 ? std::strchr(text, ch) : nullptr;
}

char* HkStr::FindString(char* text, const char* wanted) {
    return text != nullptr ? std::strstr(text, orEmpty(wanted)) : nullptr;
}

const char* HkStr::FindString(const char* text, const char* wanted) {
    return text != nullptr ? std::strstr(text, orEmpty(wanted)) : nullptr;
}

int HkStr::ICompare(const char* a, const char* b) {
    return INCompare(a, b, std::numeric_limits<std::size_t>::max());
}

int HkStr::INCompare(const char* a, const char* b, std::size_t n) {
    a = orEmpty(a);
    b = orEmpty(b);
    for (std::size_t i = 0; i < n; ++i) {
        const int difference = folded(a[i]) - folded(b[i]);
        if (difference != 0 || a[i] == '\0') {
            return difference;
        }
    }
    return 0;
}

// A mismatch behind a star lets that star take one character more; earlier stars never need another try.
int HkStr::IMatch(const char* text, const char* pattern) {
    text = orEmpty(text);
    pattern = orEmpty(pattern);
    const char* starPattern = nullptr;
    const char* starText = nullptr;
    while (*text != '\0') {
        if (*pattern == '*') {
            starPattern = ++pattern;
            starText = text;
        } else if (folded(*pattern) == folded(*text)) {
            ++pattern;
            ++text;
        } else if (starPattern != nullptr) {
            pattern = starPattern;
            text = ++starText;
        } else {
            return 0;
        }
    }
    while (*pattern == '*') {
        ++pattern;
    }
    return *pattern == '\0' ? 1 : 0;
}

std::int32_t HkStr::AToL(const char* text) {
    text = orEmpty(text);
    while (isBlank(*text)) {
        ++text;
    }
    const bool negative = *text == '-';
    if (*text == '-' || *text == '+') {
        ++text;
    }
    const std::int64_t limit = negative ? -std::int64_t{std::numeric_limits<std::int32_t>::min()}
                                        : std::int64_t{std::numeric_limits<std::int32_t>::max()};
    std::int64_t value = 0;
    for (; IsDigit(static_cast<unsigned char>(*text)) != 0 && value < limit; ++text) {
        value = value * 10 + (*text - '0');
    }
    value = value < limit ? value : limit;
    return static_cast<std::int32_t>(negative ? -value : value);
}

int HkStr::AToI(const char* text) {
    return AToL(text);
}

int HkStr::IsDigit(int ch) {
    return ch >= '0' && ch <= '9' ? 1 : 0;
}

int HkStr::IsAscii(int ch) {
    return ch >= 0 && ch <= 127 ? 1 : 0;
}

int HkStr::SPrintf(char* dest, const char* format, ...) {
    if (dest == nullptr || format == nullptr) {
        return 0;
    }
    std::va_list arguments;
    va_start(arguments, format);
    const int written = std::vsprintf(dest, withoutLong(format).c_str(), arguments);
    va_end(arguments);
    return written;
}

}  // namespace HostKit
