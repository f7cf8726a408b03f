// The characters that a stream's buffer holds ready: to be walked over without a call for each.
#pragma once

#include <algorithm>
#include <cstddef>
#include <limits>
#include <streambuf>

class ReadyText {
public:
    /// Nothing is ready where there is no buffer.
    explicit ReadyText(std::streambuf* buffer) : m_buffer(buffer) { open(); }
    ~ReadyText() { close(); }
    ReadyText(const ReadyText&) = delete;
    ReadyText& operator=(const ReadyText&) = delete;

    const char* begin() const { return m_next; }
    const char* end() const { return m_end; }

    /// The characters before @p next are taken; the buffer hears of it when this one is closed.
    void takeUpTo(const char* next) { m_next = next; }

    /// Gives the buffer back to its own operations; nothing is ready until it is opened again.
    void close() {
        if (m_next != m_opened) {
            Members::drop(*m_buffer, static_cast<int>(m_next - m_opened));
        }
        m_opened = m_next = m_end = nullptr;
    }

    void open() {
        if (m_buffer != nullptr) {
            m_opened = m_next = Members::begin(*m_buffer);
            m_end = m_opened + std::min(Members::end(*m_buffer) - m_opened, mostAtOnce);
        }
    }

private:
    static constexpr std::ptrdiff_t mostAtOnce = std::numeric_limits<int>::max();

    /// A buffer's protected members, as a class derived from it may name them.
    struct Members : std::streambuf {
        static const char* begin(const std::streambuf& buffer) { return (buffer.*&Members::gptr)(); }
        static const char* end(const std::streambuf& buffer) { return (buffer.*&Members::egptr)(); }
        static void drop(std::streambuf& buffer, int count) { (buffer.*&Members::gbump)(count); }
    };

    std::streambuf* const m_buffer;
    const char* m_opened = nullptr;
    const char* m_next = nullptr;
    const char* m_end = nullptr;
};
