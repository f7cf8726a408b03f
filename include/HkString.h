/// @file
/// The text class of the library.
#pragma once

#include <cstdint>
#include <string_view>

#include "TessalExport.h"

namespace HostKit {

/// Text as one pointer to zero-terminated bytes, with the 32-bit length in the four bytes before them.
///
/// The pointer is never null, and its memory form is fixed: callers read both the pointer and the length word without
/// a call. The text may hold any byte, zero too. Copies share their text until one of them changes, which never
/// shows; separate objects may be used by separate threads. A text may be a piece of the string's own text wherever
/// a text is taken. Where a result would pass 4294967294 bytes, std::length_error is thrown; every operation either
/// completes or leaves the string as it was.
class TESSAL_API HkString {
public:
    /// The result of a search that found nothing, and the count that means "up to the terminator".
    static constexpr std::uint32_t npos = 0xFFFFFFFFU;

    /// How GetIndexOfString compares.
    enum CompareType { CompareExact = 0, CompareIgnoreCase = 1 };

    HkString() noexcept;
    /// Copies the text; null gives the empty text.
    HkString(const char* text);  // NOLINT(google-explicit-constructor): a text stands for a string everywhere
    HkString(const HkString& other) noexcept;
    HkString(HkString&& other) noexcept;
    /// Copies @p length bytes, which may hold zeros.
    explicit HkString(std::string_view text);
    ~HkString();

    HkString& operator=(const HkString& other) noexcept;
    HkString& operator=(HkString&& other) noexcept;
    HkString& operator=(const char* text);

    HkString& operator+=(const HkString& other);
    HkString& operator+=(const char* text);
    HkString& operator+=(char ch);

    /// Appends @p count bytes of @p text; npos means up to its terminator.
    void Append(const char* text, std::uint32_t count);
    /// Makes the string empty.
    void Empty();
    /// Replaces the text by the formatted one. Gives the string itself.
    HkString& Format(const char* format, ...) TESSAL_PRINTF(2, 3);
    /// Puts @p count copies of @p ch before the position @p index; a position past the end is the end.
    void Insert(std::uint32_t index, char ch, std::uint32_t count);
    /// Index of the first @p ch or, when @p second is not 0, of the first of either; npos when there is none.
    std::uint32_t GetIndexOfFirstChar(char ch, char second) const;
    /// Index of the first place of @p text, npos when there is none; the empty text is found at 0.
    std::uint32_t GetIndexOfString(const char* text, CompareType mode) const;
    /// Changes the case of the ASCII letters in place.
    void MakeUpper();
    void MakeLower();

    /// The text itself, valid until the string changes.
    operator const char*() const noexcept { return m_text; }  // NOLINT(google-explicit-constructor): part of the form
    const char* c_str() const noexcept { return m_text; }
    /// Length in bytes, without the terminator.
    std::uint32_t Length() const noexcept { return reinterpret_cast<const std::uint32_t*>(m_text)[-1]; }
    bool IsEmpty() const noexcept { return Length() == 0; }
    std::string_view view() const noexcept { return {m_text, Length()}; }

private:
    char* m_text;
};

/// Equal: the same length and the same bytes; case counts.
inline bool operator==(const HkString& a, const HkString& b) {
    return a.view() == b.view();
}
inline bool operator!=(const HkString& a, const HkString& b) {
    return !(a == b);
}
/// Less by unsigned bytes; a proper prefix is the lesser.
inline bool operator<(const HkString& a, const HkString& b) {
    return a.view() < b.view();
}
/// Compares with a zero-terminated text; null is the empty text.
inline bool operator==(const HkString& a, const char* b) {
    return a.view() == std::string_view(b != nullptr ? b : "");
}
inline bool operator!=(const HkString& a, const char* b) {
    return !(a == b);
}
inline bool operator==(const char* a, const HkString& b) {
    return b == a;
}
inline bool operator!=(const char* a, const HkString& b) {
    return !(b == a);
}

}  // namespace HostKit

using HostKit::HkString;
