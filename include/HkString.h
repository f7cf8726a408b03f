/// @file
/// The text class of the library.
#pragma once

#include <atomic>
#include <cstddef>
#include <cstdint>
#include <cstring>
#include <string_view>
#include <utility>

#include "HkStr.h"
#include "TessalExport.h"

namespace HostKit {

/// Text as one pointer to zero-terminated bytes, with the 32-bit length in the four bytes before them.
///
/// The pointer is never null, and its memory form is fixed: callers read both the pointer and the length word without
/// a call. The text may hold any byte, zero too. Copies of a long text share it until one of them changes, which never
/// shows; separate objects may be used by separate threads. A text may be a piece of the string's own text wherever
/// a text is taken. Where a result would pass 4294967294 bytes, std::length_error is thrown; every operation either
/// completes or leaves the string as it was.
class TESSAL_API HkString {
public:
    /// The result of a search that found nothing, and the count that means "up to the terminator".
    static constexpr std::uint32_t npos = 0xFFFFFFFFU;

    /// How GetIndexOfString compares.
    using CompareType = int;
    static constexpr CompareType CompareExact = 0;
    static constexpr CompareType CompareIgnoreCase = 1;

    HkString() noexcept : m_text(emptyText()) {}
    /// Copies the text; null gives the empty text.
    HkString(const char* text)  // NOLINT(google-explicit-constructor): a text stands for a string everywhere
        : m_text(newText(HkStr::View(text))) {}
    /// Copies the bytes, which may hold zeros.
    explicit HkString(std::string_view text) : m_text(newText(text)) {}
    HkString(const HkString& other) : m_text(copiedText(other.m_text)) {}
    HkString(HkString&& other) noexcept : m_text(std::exchange(other.m_text, emptyText())) {}
    ~HkString() { releaseText(m_text); }

    HkString& operator=(const HkString& other);
    HkString& operator=(HkString&& other) noexcept {
        std::swap(m_text, other.m_text);
        return *this;
    }
    HkString& operator=(const char* text) {
        assign(HkStr::View(text));
        return *this;
    }

    HkString& operator+=(const HkString& other) {
        append(other.view());
        return *this;
    }
    HkString& operator+=(const char* text) {
        append(HkStr::View(text));
        return *this;
    }
    HkString& operator+=(char ch) {
        char* const text = m_text;
        const std::size_t length = Length();
        if (length < headOf(text).room.load(std::memory_order_relaxed)) {
            text[length] = ch;
            setLength(text, length + 1);
        } else {
            append({&ch, 1});
        }
        return *this;
    }

    /// Appends @p count bytes of @p text; npos means up to its terminator. Null appends nothing.
    void Append(const char* text, std::uint32_t count) {
        append(text == nullptr || count == npos ? HkStr::View(text) : std::string_view(text, count));
    }
    /// Makes the string empty.
    void Empty() noexcept { releaseText(std::exchange(m_text, emptyText())); }
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
    std::uint32_t Length() const noexcept { return headOf(m_text).length; }
    bool IsEmpty() const noexcept { return Length() == 0; }
    std::string_view view() const noexcept { return {m_text, Length()}; }

private:
    /// What stands before a text; the length word is the last of it.
    struct Head {
        std::atomic<std::uint32_t> owners;  ///< strings that share the text
        std::uint32_t capacity;             ///< bytes that the text has room for, without the terminator
        std::atomic<std::uint32_t> room;    ///< the capacity, or 0 since the text is shared
        std::uint32_t length;
    };
    /// The text of every string that is empty from its start: never counted, written or released. It is as long as
    /// the pieces that comparisons load, of which compilers would otherwise warn although no empty text is compared so.
    struct EmptyText {
        Head head;
        char text[16];
    };

    static EmptyText s_empty;

    static char* emptyText() noexcept { return s_empty.text; }
    static Head& headOf(char* text) noexcept { return reinterpret_cast<Head*>(text)[-1]; }

    static void setLength(char* text, std::size_t length) noexcept {
        headOf(text).length = static_cast<std::uint32_t>(length);
        text[length] = '\0';
    }
    static char* newBlock(std::size_t capacity);
    static char* shortTextIn(void* block) noexcept;
    static char* newLongBlock(std::size_t capacity);
    static char* newText(std::string_view content);
    [[gnu::noinline]] static char* newLongText(std::string_view content);  // a short text saves no registers so
    static char* copiedText(char* text);
    static void releaseText(char* text) noexcept {
        if (text != emptyText()) {
            releaseBlock(text);
        }
    }
    static void releaseBlock(char* text) noexcept;

    bool hasRoom(std::size_t length) noexcept;
    void assign(std::string_view content);
    void append(std::string_view content);
    void appendToNewBlock(std::string_view content);
    void replaceText(char* text) noexcept { releaseText(std::exchange(m_text, text)); }
    void makeOwn(std::size_t room);

    char* m_text;
};

/// Equal: the same length and the same bytes; case counts.
inline bool operator==(const HkString& a, const HkString& b) {
    return a.Length() == b.Length() && HkStr::AreSame(a.c_str(), b.c_str(), a.Length());
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
    return a.view() == HkStr::View(b);
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
