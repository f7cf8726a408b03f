// The characters that a stream's buffer holds ready: to be walked over without a call for each.
#pragma once

#include <algorithm>
#include <cstddef>
#include <limits>
#include <streambuf>

class ReadyText {
public:
    explicit ReadyText(std::streambuf& buffer)
        : m_buffer(buffer),
          m_begin(Members::begin(buffer)),
          m_end(m_begin + std::min(Members::end(buffer) - m_begin, mostAtOnce)) {}

    const char* begin() const { return m_begin; }
    const char* end() const { return m_end; }

    /// Takes all before @p behind from the buffer.
    void takeUpTo(const char* behind) const { Members::drop(m_buffer, static_cast<int>(behind - m_begin)); }

private:
    static constexpr std::ptrdiff_t mostAtOnce = std::numeric_limits<int>::max();

    /// A buffer's protected members, as a class derived from it may name them.
    struct Members : std::streambuf {
        static const char* begin(const std::streambuf& buffer) { return (buffer.*&Members::gptr)(); }
        static const char* end(const std::streambuf& buffer) { return (buffer.*&Members::egptr)(); }
        static void drop(std::streambuf& buffer, int count) { (buffer.*&Members::gbump)(count); }
    };

    std::streambuf& m_buffer;
    const char* m_begin;
    const char* m_end;
};
