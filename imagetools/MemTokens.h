// Memory text as tokens: what stands between blanks and comments, with its place.
#pragma once

#include <cstddef>
#include <string_view>

namespace ImageTools {

struct MemToken {
    std::string_view text;  ///< not empty
    std::size_t line = 0;   ///< counted from 1, as the column is
    std::size_t column = 0;
};

class MemTokens {
public:
    explicit MemTokens(std::string_view text) : m_text(text) {}

    /// False at the end of the text.
    bool next(MemToken& token);

    /// Whether the text ended inside a comment, and where that began.
    bool isCommentOpen() const { return m_isCommentOpen; }
    const MemToken& openComment() const { return m_comment; }

private:
    bool skipBlanksAndComments();
    void skipLine();
    void skipBlock();
    void step();
    bool startsWith(const char* two) const { return m_text.substr(m_at, 2) == two; }
    MemToken here() const { return {{}, m_line, m_at - m_lineStart + 1}; }

    std::string_view m_text;
    std::size_t m_at = 0;
    std::size_t m_line = 1;
    std::size_t m_lineStart = 0;
    bool m_isCommentOpen = false;
    MemToken m_comment;
};

}  // namespace ImageTools
