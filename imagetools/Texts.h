// Numbers in messages.
#pragma once

#include <cinttypes>
#include <cstdint>
#include <cstdio>
#include <string>

namespace ImageTools {

/// What went wrong; empty where nothing did.
using Problem = std::string;

inline std::string hexText(std::uint64_t value, int digits = 1) {
    char text[24];
    std::snprintf(text, sizeof text, "0x%0*" PRIX64, digits, value);
    return text;
}

/// "0x10 to 0x1F" for a range that ends behind 0x1F; it is not empty.
inline std::string rangeText(std::uint64_t first, std::uint64_t last) {
    return hexText(first) + " to " + hexText(last - 1);
}

/// "1 byte", "2 bytes".
inline std::string countText(std::uint64_t count, const char* what) {
    return std::to_string(count) + ' ' + what + (count == 1 ? "" : "s");
}

}  // namespace ImageTools
