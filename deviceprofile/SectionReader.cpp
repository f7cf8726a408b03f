#include "deviceprofile/SectionReader.h"

#include <cstring>
#include <string>
#include <unordered_set>

#include "deviceprofile/Blanks.h"
#include "deviceprofile/LogicalLines.h"
#include "s/UnitOrigin.h"

namespace DeviceProfile {
namespace {

constexpr UnitOrigin origin{"../s/SectionReader", "$Revision: 1.1 $"};

/// What a message shows of a line.
constexpr std::size_t quotedLength = 40;

/// A file that is no data file could have a message for each of its lines.
constexpr std::uint32_t mostReports = 100;

std::string_view textOf(const char* begin, const char* end) {
    return {begin, static_cast<std::size_t>(end - begin)};
}

/// The start of a text as printable characters.
std::string quote(std::string_view text) {
    std::string result;
    for (const char ch : text.substr(0, quotedLength)) {
        if (ch >= ' ' && ch <= '~') {
            result += ch;
        } else {
            constexpr const char* digits = "0123456789ABCDEF";
            const auto byte = static_cast<unsigned char>(ch);
            result += {'\\', 'x', digits[byte >> 4], digits[byte & 15]};
        }
    }
    return result + (text.size() > quotedLength ? "..." : "");
}

/// The name in a section's line, empty when the line has another form.
std::string_view sectionName(const LogicalLine& line) {
    if (line.end[-1] != ']') {
        return {};
    }
    char* const begin = skipBlanks(line.begin + 1, line.end - 1);
    const std::string_view name = textOf(begin, dropBlanks(begin, line.end - 1));
    return name.find_first_of(std::string_view("[]\0", 3)) == std::string_view::npos ? name : std::string_view();
}

class SectionReader {
public:
    SectionReader(FileText& text, std::string_view section, LineReports reports)
        : m_text(text),
          m_section(section),
          m_reports(reports),
          m_hasZeros(std::memchr(text.bytes.get(), 0, text.size) != nullptr),
          m_keys(text.bytes.get()) {}

    KeyList read() {
        LogicalLines lines(m_text.bytes.get(), m_text.bytes.get() + m_text.size);
        for (LogicalLine line; lines.next(line);) {
            if (const char* const problem = take(line)) {
                reportMalformed(line, problem);
            }
        }
        if (m_reported > mostReports) {
            origin.report().issueInfo("%s: %u more messages are left out.\n", m_text.name.c_str(),
                                      m_reported - mostReports);
        }
        return std::move(m_keys);
    }

private:
    /// Gives null, or what is wrong with the line.
    const char* take(const LogicalLine& line) {
        if (m_hasZeros && std::memchr(line.begin, 0, static_cast<std::size_t>(line.end - line.begin)) != nullptr) {
            return "a zero byte in the line";
        }
        if (*line.begin == '[') {
            return openSection(line);
        }
        return line.equals != nullptr ? setKey(line) : "neither [section] nor KEY = value";
    }

    const char* openSection(const LogicalLine& line) {
        const std::string_view name = sectionName(line);
        if (name.empty()) {
            return "a section that is not written as [name]";
        }
        m_isInSection = true;
        m_isWanted = name == m_section;
        return nullptr;
    }

    const char* setKey(const LogicalLine& line) {
        char* const keyEnd = dropBlanks(line.begin, line.equals);
        if (keyEnd == line.begin) {
            return "no key before the =";
        }
        if (!m_isInSection) {
            return "a key before the first [section]";
        }
        if (m_isWanted) {
            add(line, textOf(line.begin, keyEnd));
        }
        return nullptr;
    }

    /// Moves the key up to its value, a zero between them, which makes it an entry of the list.
    void add(const LogicalLine& line, std::string_view name) {
        char* const value = skipBlanks(line.equals + 1, line.end);
        char* const key = value - 1 - name.size();
        std::memmove(key, name.data(), name.size());
        value[-1] = '\0';
        if (line.isCutOff && m_reports.malformed && mayReport()) {
            origin.report().issueInfo("%s:%u: the file ends where the value of %s should go on.\n", m_text.name.c_str(),
                                      line.number, quote(key).c_str());
        }
        const std::uint32_t former = m_keys.set(key, line.number, line.isContinued ? line.end : nullptr);
        if (former != 0 && m_reports.repeated && mayReport()) {
            origin.report().issueInfo("%s:%u: %s is set again and replaces the value of line %u.\n",
                                      m_text.name.c_str(), line.number, quote(key).c_str(), former);
        }
    }

    void reportMalformed(const LogicalLine& line, const char* problem) {
        if (m_reports.malformed && mayReport()) {
            const char* const end = line.isContinued ? joinPieces(line.begin, line.end) : line.end;
            origin.report().issueInfo("%s:%u: %s, the line is skipped: \"%s\"\n", m_text.name.c_str(), line.number,
                                      problem, quote(textOf(line.begin, end)).c_str());
        }
    }

    bool mayReport() { return ++m_reported <= mostReports; }

    FileText& m_text;
    const std::string_view m_section;
    const LineReports m_reports;
    const bool m_hasZeros;
    bool m_isInSection = false;
    bool m_isWanted = false;
    std::uint32_t m_reported = 0;
    KeyList m_keys;
};

}  // namespace

KeyList readSection(FileText& text, std::string_view section, LineReports reports) {
    return SectionReader(text, section, reports).read();
}

std::vector<std::string_view> listSections(FileText& text) {
    std::unordered_set<std::string_view> seen;
    std::vector<std::string_view> names;
    LogicalLines lines(text.bytes.get(), text.bytes.get() + text.size);
    for (LogicalLine line; lines.next(line);) {
        const std::string_view name = *line.begin == '[' ? sectionName(line) : std::string_view();
        if (!name.empty() && seen.insert(name).second) {
            names.push_back(name);
        }
    }
    return names;
}

}  // namespace DeviceProfile
