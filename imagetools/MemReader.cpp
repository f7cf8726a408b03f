#include "imagetools/MemReader.h"

#include <algorithm>
#include <utility>

#include "imagetools/MemTokens.h"
#include "imagetools/Texts.h"
#include "s/ByteTables.h"

namespace ImageTools {
namespace {

constexpr std::size_t reportedProblems = 20;
constexpr std::size_t largestWidth = 2048;  // digits of a word, far above any memory
constexpr std::size_t mostRuns = std::size_t{1} << 20;

/// Bytes that follow each other without a new address.
struct Run {
    std::uint64_t address;
    std::size_t begin;
    std::size_t end;
    MemToken at;
};

class Reader {
public:
    Reader(std::string_view text, const MemOptions& options, unsigned char* bytes)
        : m_tokens(text), m_options(options), m_bytes(bytes) {}

    std::vector<std::string> read(SegmentMap& segments) {
        MemToken token;
        while (m_problems.size() < reportedProblems && m_tokens.next(token)) {
            if (token.text[0] == '@') {
                takeAddress(token);
            } else {
                takeWord(token);
            }
        }
        if (m_tokens.isCommentOpen()) {
            complain(m_tokens.openComment(), "the comment is not closed, expected */");
        }
        addRuns(segments);
        return std::move(m_problems);
    }

private:
    void complain(const MemToken& at, const std::string& text) {
        if (m_problems.size() < reportedProblems) {
            m_problems.push_back(std::to_string(at.line) + ':' + std::to_string(at.column) + ": " + text);
        }
    }

    void takeAddress(const MemToken& token) {
        std::uint64_t value = 0;
        std::size_t digits = 0;
        for (const char ch : token.text.substr(1)) {
            if (ch == '_' && digits != 0) {
                continue;
            }
            const unsigned char digit = ByteTables::valueOf(ch);
            if (digit == ByteTables::notADigit) {
                complain(token, "expected hexadecimal digits behind @, not " + shown(token));
                return;
            }
            value = value << 4 | digit;
            ++digits;
            if (value >= addressSpace) {
                complain(token, "address " + shown(token) + " is past the last one, " + hexText(addressSpace - 1));
                return;
            }
        }
        if (digits == 0) {
            complain(token, "expected hexadecimal digits directly behind @");
            return;
        }
        m_address = value;
        m_isPlaced = false;
    }

    void takeWord(const MemToken& token) {
        std::size_t digits = 0;
        const std::size_t begin = m_used;
        for (const char ch : token.text) {
            if (ch == '_' && digits != 0) {
                continue;
            }
            const int digit = valueOf(token, ch);
            if (digit < 0) {
                m_used = begin;
                return;
            }
            unsigned char& byte = m_bytes[begin + digits / 2];
            byte = static_cast<unsigned char>(digits % 2 == 0 ? digit << 4 : byte | digit);
            ++digits;
        }
        if (checkWidth(token, digits)) {
            place(token, begin, digits / 2);
        }
    }

    /// The digit's value; negative, after a complaint, where it has none.
    int valueOf(const MemToken& token, char ch) {
        const unsigned char digit = ByteTables::valueOf(ch);
        if (digit != ByteTables::notADigit) {
            return digit;
        }
        const bool unknown = ch == 'x' || ch == 'X' || ch == 'z' || ch == 'Z';
        if (unknown && m_options.fillsUnknown) {
            return 0xF;
        }
        complain(token, unknown ? "unknown bits in " + shown(token)
                                : "expected a word of hexadecimal digits or @, not " + shown(token));
        return -1;
    }

    bool checkWidth(const MemToken& token, std::size_t digits) {
        if (m_width == 0) {
            if (digits % 2 != 0 || digits > largestWidth) {
                complain(token, "a word of " + countText(digits, "digit") + " holds no whole number of bytes up to " +
                                    std::to_string(largestWidth / 2));
                return false;
            }
            m_width = digits;
        }
        if (digits != m_width) {
            complain(token,
                     "a word of " + countText(digits, "digit") + ", the first one has " + std::to_string(m_width));
            return false;
        }
        return true;
    }

    /// Gives the word that was read last its address.
    void place(const MemToken& token, std::size_t begin, std::size_t size) {
        if (m_options.leastSignificantFirst) {
            std::reverse(m_bytes + begin, m_bytes + begin + size);
        }
        m_used = begin + size;
        if (!m_isPlaced) {
            const std::uint64_t address = m_options.byteAddresses ? m_address : m_address * size;
            m_isPlaced = true;
            if (m_runs.empty() || end(m_runs.back()) != address) {
                if (m_runs.size() == mostRuns) {
                    complain(token, "more than " + std::to_string(mostRuns) + " separate addresses");
                    return;
                }
                m_runs.push_back({address, begin, begin, token});
            }
        }
        m_runs.back().end = m_used;
        if (end(m_runs.back()) > addressSpace) {
            complain(token, "the word at address " + hexText(end(m_runs.back()) - size) + " goes past the last one, " +
                                hexText(addressSpace - 1));
            m_runs.back().end = begin;
        }
    }

    static std::uint64_t end(const Run& run) { return run.address + (run.end - run.begin); }

    void addRuns(SegmentMap& segments) {
        for (const Run& run : m_runs) {
            const auto differing = segments.addAgreeing({run.address, m_bytes + run.begin, run.end - run.begin});
            if (differing) {
                complain(run.at, "the data from here gives address " + hexText(*differing) +
                                     " another byte than the data before");
            }
        }
    }

    static std::string shown(const MemToken& token) {
        constexpr std::size_t longest = 40;
        std::string text;
        for (const char ch : token.text.substr(0, longest)) {
            text += ch >= ' ' && ch <= '~' ? ch : '?';
        }
        return '"' + text + (token.text.size() > longest ? "...\"" : "\"");
    }

    MemTokens m_tokens;
    MemOptions m_options;
    unsigned char* m_bytes;
    std::size_t m_used = 0;
    std::size_t m_width = 0;      ///< digits of a word; 0 before the first one
    std::uint64_t m_address = 0;  ///< as the last "@" gave it
    bool m_isPlaced = false;      ///< a word came since then
    std::vector<Run> m_runs;
    std::vector<std::string> m_problems;
};

}  // namespace

std::vector<std::string> readMem(std::string_view text, const MemOptions& options, unsigned char* bytes,
                                 SegmentMap& segments) {
    return Reader(text, options, bytes).read(segments);
}

}  // namespace ImageTools
