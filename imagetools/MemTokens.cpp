#include "imagetools/MemTokens.h"

#include <algorithm>

namespace ImageTools {
namespace {

bool isBlank(char ch) {
    return ch == ' ' || (ch >= '\t' && ch <= '\r');
}

}  // namespace

bool MemTokens::next(MemToken& token) {
    if (!skipBlanksAndComments()) {
        return false;
    }
    token = here();
    const std::size_t begin = m_at;
    while (m_at < m_text.size() && !isBlank(m_text[m_at]) && !startsWith("//") && !startsWith("/*")) {
        ++m_at;
    }
    token.text = m_text.substr(begin, m_at - begin);
    return true;
}

/// False at the end of the text.
bool MemTokens::skipBlanksAndComments() {
    while (m_at < m_text.size()) {
        if (isBlank(m_text[m_at])) {
            step();
        } else if (startsWith("//")) {
            skipLine();
        } else if (startsWith("/*")) {
            skipBlock();
        } else {
            return true;
        }
    }
    return false;
}

void MemTokens::skipLine() {
    m_at = std::min(m_text.find_first_of("\r\n", m_at), m_text.size());
}

void MemTokens::skipBlock() {
    m_comment = here();
    const std::size_t end = m_text.find("*/", m_at + 2);
    m_isCommentOpen = end == std::string_view::npos;
    const std::size_t behind = m_isCommentOpen ? m_text.size() : end + 2;
    while (m_at < behind) {
        step();
    }
}

/// Lines end in LF, CR LF or CR.
void MemTokens::step() {
    const bool isReturn = m_text[m_at] == '\r' && m_text.substr(m_at + 1, 1) != "\n";
    const bool endsLine = m_text[m_at] == '\n' || isReturn;
    ++m_at;
    if (endsLine) {
        ++m_line;
        m_lineStart = m_at;
    }
}

}  // namespace ImageTools
