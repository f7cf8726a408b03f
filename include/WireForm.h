/// @file
/// The bytes of numbers and truth values between tool processes.
#pragma once

#include <cstdint>

/// A number is 4 bytes, least significant first, in two's complement; of a truth value's byte the lowest bit counts.
namespace WireForm {

constexpr int intSize = 4;

inline void storeInt(char* bytes, int value) {
    const auto bits = static_cast<std::uint32_t>(value);
    bytes[0] = static_cast<char>(bits);
    bytes[1] = static_cast<char>(bits >> 8);
    bytes[2] = static_cast<char>(bits >> 16);
    bytes[3] = static_cast<char>(bits >> 24);
}

inline int loadInt(const char* bytes) {
    const auto byte = [bytes](int i) { return std::uint32_t{static_cast<unsigned char>(bytes[i])}; };
    return static_cast<int>(byte(0) | byte(1) << 8 | byte(2) << 16 | byte(3) << 24);
}

inline bool loadBool(char byte) {
    return (static_cast<unsigned char>(byte) & 1U) != 0;
}

}  // namespace WireForm
