// Reads a format text into its compiled form.
#include <algorithm>

#include "HkStr.h"
#include "hostkit/CmdFormat.h"
#include "hostkit/CmdValue.h"

namespace HostKit::cmd {
namespace {

constexpr const char* blanks = " \t\r\n";
constexpr std::string_view reserved = " \t\r\n[](){}<>|\"'=.*,:";

struct TypeWord {
    const char* word;
    Type type;
};
constexpr TypeWord typeWords[] = {
    {"text", Type::Text}, {"int", Type::Integer}, {"hex", Type::Hex}, {"file", Type::File}, {"group", Type::Group},
};

Type findType(std::string_view word) {
    for (const TypeWord& row : typeWords) {
        if (word == row.word) {
            return row.type;
        }
    }
    return Type::None;
}

std::vector<std::string> split(std::string_view text, std::string_view separators) {
    std::vector<std::string> words;
    std::size_t begin = 0;
    while ((begin = text.find_first_not_of(separators, begin)) != std::string_view::npos) {
        const std::size_t end = std::min(text.find_first_of(separators, begin), text.size());
        words.emplace_back(text.substr(begin, end - begin));
        begin = end;
    }
    return words;
}

std::string folded(std::string text) {
    std::transform(text.begin(), text.end(), text.begin(), &HkStr::ToLower);
    return text;
}

/// Walks the text once. The first failure is kept, and the walk ends there.
class Reader {
public:
    explicit Reader(Format& format) : m_format(format), m_text(format.text) {}

    void run() {
        skipBlanks();
        readHelp(m_format.help);
        while (skipBlanks()) {
            readItem();
        }
        checkPositionals();
        sortNames();
    }

private:
    bool atEnd() const { return m_at >= m_text.size(); }
    char peek() const { return atEnd() ? '\0' : m_text[m_at]; }

    /// False at the end of the text.
    bool skipBlanks() {
        m_at = std::min(m_text.find_first_not_of(blanks, m_at), m_text.size());
        return !atEnd();
    }

    void fail(std::size_t offset, std::string reason) {
        if (m_format.error.empty()) {
            m_format.error = std::move(reason);
            m_format.errorOffset = offset;
        }
        m_at = m_text.size();
    }

    bool take(char wanted) {
        const bool found = peek() == wanted && !atEnd();
        m_at += found ? 1 : 0;
        return found;
    }

    void expect(char wanted) {
        skipBlanks();
        if (!take(wanted)) {
            fail(m_at, std::string("expected ") + wanted);
        }
    }

    bool takeDots() {
        const bool found = m_text.compare(m_at, 3, "...") == 0;
        m_at += found ? 3 : 0;
        return found;
    }

    /// Text in single quotes, in which a doubled one stands for one.
    void readHelp(std::string& help) {
        skipBlanks();
        const std::size_t begin = m_at;
        if (!take('\'')) {
            return;
        }
        if (!help.empty()) {
            return fail(begin, "a second help text");
        }
        do {
            const std::size_t end = m_text.find('\'', m_at);
            if (end == std::string_view::npos) {
                return fail(begin, "the help text has no closing '");
            }
            help += help.empty() ? "" : "'";
            help += m_text.substr(m_at, end - m_at);
            m_at = end + 1;
        } while (take('\''));
    }

    void readItem() {
        if (take('[')) {
            readOptional();
        } else if (take('(')) {
            readRequired();
        } else if (take('{')) {
            readOneOf(true);
        } else {
            readElement(true);
        }
    }

    void readOptional() {
        skipBlanks();
        if (take('{')) {
            readOneOf(false);
            return expect(']');
        }
        readElement(false);
        closeElement(']');
    }

    void readRequired() {
        skipBlanks();
        readElement(true);
        closeElement(')');
    }

    void closeElement(char bracket) {
        expect(bracket);
        if (m_format.isMalformed()) {
            return;
        }
        Rule& rule = m_format.rules.back();
        if (takeDots()) {
            (rule.kind == Kind::Positional ? rule.value.list : rule.repeated) = true;
        }
        readHelp(rule.help);
    }

    void readOneOf(bool required) {
        const std::size_t begin = m_at;
        OneOf oneOf;
        oneOf.required = required;
        while (skipBlanks() && !take('}')) {
            readElement(false);
            if (!m_format.isMalformed()) {
                m_format.rules.back().inOneOf = true;
                oneOf.rules.push_back(static_cast<int>(m_format.rules.size()) - 1);
            }
        }
        if (m_text[m_at - 1] != '}' || oneOf.rules.size() < 2) {
            return fail(begin, "expected } behind at least two arguments");
        }
        m_format.oneOfs.push_back(std::move(oneOf));
    }

    void readElement(bool required) {
        Rule rule;
        rule.required = required;
        const std::size_t begin = m_at;
        const char first = peek();
        if (first == '-') {
            readSwitch(rule);
        } else if (first == '"') {
            readWord(rule);
        } else if (first == '<') {
            rule.kind = Kind::Positional;
            readValue(rule.value);
            addName(rule, rule.value.name, begin);
            m_format.positionals.push_back(static_cast<int>(m_format.rules.size()));
        } else {
            return fail(begin, "expected a -switch, a \"word\" or an <argument>");
        }
        readHelp(rule.help);
        m_format.rules.push_back(std::move(rule));
    }

    void readSwitch(Rule& rule) {
        do {
            skipBlanks();
            const std::size_t begin = m_at;
            const std::size_t end = std::min(m_text.find_first_of(reserved, begin), m_text.size());
            if (end - begin < 2 || m_text[begin] != '-' || m_text.substr(begin, end - begin) == "--") {
                return fail(begin, "expected the name of a switch, a dash and letters");
            }
            addName(rule, std::string(m_text.substr(begin, end - begin)), begin);
            m_at = end;
            skipBlanks();
        } while (take('|'));
        readSwitchValue(rule);
    }

    void readSwitchValue(Rule& rule) {
        if (peek() == '<') {
            return readValue(rule.value);
        }
        const std::size_t bracket = m_at;
        if (take('[')) {
            skipBlanks();
            if (peek() != '<') {
                m_at = bracket;  // the next item
                return;
            }
            readValue(rule.value);
            rule.value.optional = true;
            expect(']');
            rule.value.list = takeDots() || rule.value.list;
        }
    }

    void readWord(Rule& rule) {
        rule.kind = Kind::Word;
        const std::size_t begin = m_at++;
        const std::size_t end = m_text.find('"', m_at);
        if (end == std::string_view::npos) {
            return fail(begin, "the word has no closing \"");
        }
        addName(rule, std::string(m_text.substr(m_at, end - m_at)), begin);
        m_at = end + 1;
    }

    void addName(Rule& rule, std::string name, std::size_t offset) {
        m_format.names.push_back({folded(name), static_cast<int>(m_format.rules.size()), offset});
        rule.names.push_back(std::move(name));
    }

    /// "<name=type ...>", "<type ...>" or "<name>", then dots for a list.
    void readValue(Value& value) {
        const std::size_t begin = m_at;
        const std::size_t end = m_text.find('>', begin);
        if (end == std::string_view::npos) {
            return fail(begin, "the argument has no closing >");
        }
        const std::string_view content = m_text.substr(begin + 1, end - begin - 1);
        const std::size_t equal = content.find('=');
        const bool named = equal != std::string_view::npos;
        const std::vector<std::string> name = split(content.substr(0, named ? equal : 0), blanks);
        std::vector<std::string> type = split(content.substr(named ? equal + 1 : 0), blanks);
        if (type.empty() || name.size() != (named ? 1U : 0U)) {
            return fail(begin, named ? "expected <name=type>" : "expected a name or a type between < and >");
        }
        m_at = end + 1;
        value.name = named ? name[0] : type[0];
        if (!readType(value, type, named)) {
            return fail(begin, "unknown type " + type[0]);
        }
        readDetails(value, type, begin);
        if (value.name[0] == '-') {
            fail(begin, "the name of an argument begins with no dash");
        }
        value.list = takeDots();
    }

    static bool readType(Value& value, const std::vector<std::string>& words, bool named) {
        value.type = findType(words[0]);
        if (value.type != Type::None) {
            return true;
        }
        if (words.size() == 1 && words[0].find('|') != std::string::npos) {
            value.type = Type::Choice;
            value.choices = split(words[0], "|");
            return !value.choices.empty();
        }
        value.type = Type::Text;
        return words.size() == 1 && !named;
    }

    void readDetails(Value& value, const std::vector<std::string>& words, std::size_t begin) {
        if (value.type == Type::Group) {
            return readGroup(value, words, begin);
        }
        if (words.size() > 2 || (words.size() == 2 && value.type == Type::File)) {
            return fail(begin, "unexpected " + words.back());
        }
        if (words.size() == 2 && !readRange(value, words[1])) {
            fail(begin, "expected a range such as 1..255, not " + words[1]);
        }
    }

    /// "1..255", "1..", "..255", or one number that is both ends.
    static bool readRange(Value& value, std::string_view text) {
        const std::size_t dots = text.find("..");
        const std::string_view low = text.substr(0, dots);
        const std::string_view high = dots == std::string_view::npos ? text : text.substr(dots + 2);
        const bool counts = value.type != Type::Integer;
        return (low.empty() || readInteger(low, value.low)) && (high.empty() || readInteger(high, value.high)) &&
               (!low.empty() || !high.empty()) && value.low <= value.high && (!counts || value.high > 0);
    }

    void readGroup(Value& value, const std::vector<std::string>& words, std::size_t begin) {
        if (words.size() < 2) {
            return fail(begin, "expected the first words of the group, such as group 0|1 rp wp");
        }
        value.choices = split(words[1], "|");
        for (std::size_t i = 2; i < words.size(); ++i) {
            std::string name = words[i];
            const bool hasText = name.back() == '*';
            name.resize(name.size() - (hasText ? 1 : 0));
            value.members.push_back({std::move(name), hasText});
        }
        if (value.choices.empty()) {
            fail(begin, "expected the first words of the group, such as group 0|1 rp wp");
        }
    }

    /// Positional arguments are filled in their order, so what need not be there stands behind what must.
    void checkPositionals() {
        bool optional = false;
        bool list = false;
        for (const int index : m_format.positionals) {
            const Rule& rule = m_format.rule(index);
            if (list) {
                fail(0, "no argument can follow the list before <" + rule.value.name + ">");
            } else if (optional && rule.required) {
                fail(0, "the required <" + rule.value.name + "> stands behind an optional one");
            }
            list = rule.value.list;
            optional = optional || !rule.required;
        }
    }

    void sortNames() {
        std::vector<Name>& names = m_format.names;
        std::sort(names.begin(), names.end(), [](const Name& a, const Name& b) {
            return a.folded != b.folded ? a.folded < b.folded : a.offset < b.offset;
        });
        const auto twice = std::adjacent_find(names.begin(), names.end(),
                                              [](const Name& a, const Name& b) { return a.folded == b.folded; });
        if (twice != names.end()) {
            fail(std::next(twice)->offset, "the name " + twice->folded + " stands twice");
        }
    }

    Format& m_format;
    std::string_view m_text;
    std::size_t m_at = 0;
};

}  // namespace

void readFormat(Format& format) {
    Reader(format).run();
}

}  // namespace HostKit::cmd
