// What the fuzz targets share: each defines fuzz(), which runs once for each input.
#pragma once

#include <algorithm>
#include <cstdlib>
#include <string>
#include <string_view>

/// The bytes of an input, taken from its front.
class Input {
public:
    explicit Input(std::string_view bytes) : m_left(bytes) {}

    bool isEmpty() const { return m_left.empty(); }
    /// The next byte; 0 behind the end.
    unsigned byte() {
        const unsigned next = m_left.empty() ? 0 : static_cast<unsigned char>(m_left.front());
        m_left.remove_prefix(m_left.empty() ? 0 : 1);
        return next;
    }
    /// All that is left; views point into the input itself, so that a read beyond it is seen.
    std::string_view bytes() const { return m_left; }
    /// The same up to its first zero byte, as a caller's text ends.
    std::string text() const { return std::string(m_left.substr(0, m_left.find('\0'))); }
    /// The text of the next line, which goes without its line end.
    std::string line() {
        const Input line(m_left.substr(0, m_left.find('\n')));
        m_left.remove_prefix(std::min(line.m_left.size() + 1, m_left.size()));
        return line.text();
    }

private:
    std::string_view m_left;
};

void fuzz(Input input);

/// What is required of the library; else the run ends as a find.
inline void require(bool holds) {
    if (!holds) {
        std::abort();
    }
}
