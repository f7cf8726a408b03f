/// @file
/// Static helpers for zero-terminated text.
#pragma once

#include <cstddef>
#include <cstdint>
#include <cstring>
#include <string_view>

#include "TessalExport.h"

namespace HostKit {

/// Helpers for zero-terminated text. Null counts as the empty text everywhere. Letters are those of ASCII: no
/// operation asks the locale. Destination buffers belong to the caller, who makes them large enough.
class TESSAL_API HkStr {
public:
    /// The text as a view, of the empty text for null.
    static std::string_view View(const char* text) { return text != nullptr ? std::string_view(text) : ""; }
    /// Length in bytes; 0 for null.
    static std::size_t Len(const char* text);
    /// Copies @p source with its terminator; gives @p dest. A null destination stays null.
    static char* Copy(char* dest, const char* source);
    /// Copies at most @p n bytes and, when the source is shorter, a terminator behind them; gives @p dest. A source
    /// of @p n bytes or more leaves no terminator.
    static char* NCopy(char* dest, const char* source, std::size_t n);
    /// Appends @p source with its terminator; gives @p dest.
    static char* Cat(char* dest, const char* source);
    /// Appends at most @p n bytes and a terminator; gives @p dest.
    static char* NCat(char* dest, const char* source, std::size_t n);
    /// A new copy, which the caller releases with `delete[]`; a null source gives a new empty text.
    static char* Dup(const char* text);
    /// First place of the character @p ch, or null. The terminator is no part of the text.
    static char* FindChar(char* text, int ch);
    /// First place of @p wanted in @p text, or null.
    static char* FindString(char* text, const char* wanted);
    static const char* FindString(const char* text, const char* wanted);
    /// Compares without regard to case: below, at or above 0.
    static int ICompare(const char* a, const char* b);
    /// The same over at most the first @p n bytes.
    static int INCompare(const char* a, const char* b, std::size_t n);
    /// Non-zero when the whole text matches the pattern, in which `*` stands for any run of characters; case does not
    /// count. Takes at most length of text times length of pattern steps.
    static int IMatch(const char* text, const char* pattern);
    /// The decimal number at the start of the text, after blanks and a sign; 0 when there is none. A number past 32
    /// bits gives the nearest limit.
    static int AToI(const char* text);
    static std::int32_t AToL(const char* text);
    /// Non-zero for `0` to `9`.
    static int IsDigit(int ch);
    /// Non-zero for 0 to 127.
    static int IsAscii(int ch);
    /// printf into @p dest; gives the number of characters written. A number with a single `l` has 32 bits, on every
    /// host, so the compiler does not check the arguments.
    static int SPrintf(char* dest, const char* format, ...);

    /// True when the first @p n bytes of both are the same; bytes, not letters, and no null. A short text costs no
    /// call.
    static bool AreSame(const char* a, const char* b, std::size_t n) {
        if (n <= 2 * sizeof(std::uint64_t) && n >= sizeof(std::uint32_t)) {
            return n >= sizeof(std::uint64_t) ? HaveSameEnds<std::uint64_t>(a, b, n)
                                              : HaveSameEnds<std::uint32_t>(a, b, n);
        }
        return std::memcmp(a, b, n) == 0;
    }

    /// The ASCII letter in lower or upper case, any other character unchanged.
    static char ToLower(char ch) { return ch >= 'A' && ch <= 'Z' ? static_cast<char>(ch + ('a' - 'A')) : ch; }
    static char ToUpper(char ch) { return ch >= 'a' && ch <= 'z' ? static_cast<char>(ch - ('a' - 'A')) : ch; }

private:
    /// Compares a first and a last piece, which may overlap and together are the whole.
    template <class Piece>
    static bool HaveSameEnds(const char* a, const char* b, std::size_t n) {
        const std::size_t last = n - sizeof(Piece);
        return Load<Piece>(a) == Load<Piece>(b) && Load<Piece>(a + last) == Load<Piece>(b + last);
    }
    template <class Piece>
    static Piece Load(const char* from) {
        Piece piece;
        std::memcpy(&piece, from, sizeof piece);
        return piece;
    }
};

}  // namespace HostKit

using HostKit::HkStr;
