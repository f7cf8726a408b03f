// Texts and counts as a caller gives them, mistakes included: null is the empty text, a negative count is 0.
#pragma once

#include <cstddef>
#include <cstring>
#include <string_view>

namespace CallerText {

constexpr std::size_t size(int count) {
    return count > 0 ? static_cast<std::size_t>(count) : 0;
}

/// The text up to its terminator.
inline std::string_view view(const char* text) {
    return text != nullptr ? std::string_view(text) : std::string_view();
}

/// The text up to its terminator or the count, whichever comes first; nothing behind the terminator is read.
inline std::string_view view(const char* text, std::size_t count) {
    if (text == nullptr || count == 0) {
        return {};
    }
    const void* const end = std::memchr(text, '\0', count);
    return {text, end != nullptr ? static_cast<std::size_t>(static_cast<const char*>(end) - text) : count};
}

/// As many bytes as the count says, zeros among them.
inline std::string_view bytes(const char* text, int count) {
    return text != nullptr ? std::string_view(text, size(count)) : std::string_view();
}

}  // namespace CallerText
