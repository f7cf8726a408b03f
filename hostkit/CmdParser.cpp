#include "hostkit/CmdParser.h"

#include "HkStr.h"
#include "hostkit/CmdUsage.h"
#include "hostkit/CmdValue.h"

namespace HostKit::cmd {
namespace {

/// A dash and something that begins no number.
bool looksLikeSwitch(std::string_view token) {
    return token.size() > 1 && token[0] == '-' && HkStr::IsDigit(token[1]) == 0 && token[1] != '.';
}

std::string nearestName(const Format& format, std::string_view token) {
    NearestWord nearest(token);
    for (const Rule& rule : format.rules) {
        if (rule.kind != Kind::Positional) {
            for (const std::string& name : rule.names) {
                nearest.consider(name);
            }
        }
    }
    return std::string(nearest.word());
}

/// The nearest of the words that a choice or a group knows to the first one that it does not know.
std::string nearestChoice(const Value& value, std::string_view text) {
    std::vector<std::string> known = value.choices;
    for (const Member& member : value.members) {
        known.push_back(member.name);
    }
    while (!text.empty()) {
        const std::string_view word = text.substr(0, text.find_first_of(" :"));
        if (!word.empty() && findChoice(known, word) == nullptr) {
            NearestWord nearest(word);
            for (const std::string& candidate : known) {
                nearest.consider(candidate);
            }
            return std::string(nearest.word());
        }
        text.remove_prefix(word.empty() ? 1 : word.size());
    }
    return {};
}

}  // namespace

Parser::Parser(const Format& format, bool abbreviations, Result& result)
    : m_format(format), m_result(result), m_abbreviations(abbreviations) {
    m_result.rules.resize(format.rules.size());
}

void Parser::walk(const char* const* arguments, std::size_t count) {
    m_given.reserve(count);
    m_result.order.reserve(count);
    for (std::size_t i = 0; i < count; ++i) {
        take(arguments[i], i + 1);
    }
}

void Parser::finish() {
    endPending();
    checkRequired();
    checkOneOfs();
    sortValues();
}

int Parser::nextPositional() const {
    return m_positional < m_format.positionals.size() ? m_format.positionals[m_positional] : -1;
}

void Parser::take(const char* token, std::size_t place) {
    if (token == nullptr) {
        if (m_result.countError()) {
            report(Problem::NullArgument, {{}, {}, {}, {}, place});
        }
        m_valueDue = false;
        return;
    }
    const std::string_view view = token;
    if (!m_ended && view.size() > 1 && view[0] == '-') {
        if (view == "--") {
            endPending();
            m_ended = true;
            return;
        }
        if (takeSwitch(token, view)) {
            return;
        }
    }
    if (m_pending >= 0) {
        takeValue(m_pending, token);
    } else {
        takeOperand(token, view);
    }
}

/// False where the token is rather a value.
bool Parser::takeSwitch(const char* token, std::string_view view) {
    const char* attached = nullptr;
    const Match match = findSwitch(token, view, attached);
    if (match.rule >= 0) {
        endPending();
        beginRule(match.rule, attached);
        return true;
    }
    if (!looksLikeSwitch(view) || (m_valueDue && !match.ambiguous)) {
        return false;
    }
    endPending();
    if (match.ambiguous) {
        reportAmbiguous(view);
    } else {
        reportUnknown(Problem::UnknownSwitch, view);
    }
    m_skipping = true;
    return true;
}

/// Finds "-switch" and "-switch=value", written out or abbreviated.
Match Parser::findSwitch(const char* token, std::string_view view, const char*& attached) const {
    Match match{m_format.find(view), false};
    if (match.rule >= 0) {
        return match;
    }
    const std::size_t equal = view.find('=');
    if (equal != std::string_view::npos) {
        attached = token + equal + 1;
        view = view.substr(0, equal);
        match.rule = m_format.find(view);
    }
    if (match.rule < 0 && m_abbreviations && looksLikeSwitch(view)) {
        match = m_format.findAbbreviated(view);
    }
    return match;
}

void Parser::beginRule(int index, const char* attached) {
    const Rule& rule = m_format.rule(index);
    RuleResult& result = m_result.rules[static_cast<std::size_t>(index)];
    if (result.count > 0 && !rule.repeated && m_result.countError()) {
        report(Problem::GivenTwice, {{}, label(rule), {}, {}, 0});
    }
    ++result.count;
    m_result.order.push_back(index);
    m_skipping = false;
    if (rule.value.type == Type::None) {
        if (attached != nullptr && m_result.countError()) {
            report(Problem::NoValueTaken, {attached, label(rule), {}, {}, 0});
        }
        return;
    }
    m_pending = index;
    m_valueDue = !rule.value.optional;
    if (attached != nullptr) {
        takeValue(index, attached);
    }
}

void Parser::takeValue(int index, const char* text) {
    const Rule& rule = m_format.rule(index);
    m_valueDue = false;
    if (!fits(rule.value, text)) {
        reportValue(rule, text);
    }
    m_given.push_back({index, text});
    ++m_result.rules[static_cast<std::size_t>(index)].valueCount;
    if (!rule.value.list) {
        m_pending = -1;
    }
}

/// A token that belongs to no switch: a word or a positional argument.
void Parser::takeOperand(const char* token, std::string_view view) {
    if (m_skipping && !m_ended) {
        m_skipped = true;
        return;
    }
    const int word = m_ended ? -1 : m_format.find(view);
    if (word >= 0 && m_format.rule(word).kind == Kind::Word) {
        return beginRule(word, nullptr);
    }
    const int index = nextPositional();
    if (index < 0) {
        return reportUnknown(Problem::UnexpectedArgument, view);
    }
    ++m_result.rules[static_cast<std::size_t>(index)].count;
    m_result.order.push_back(index);
    takeValue(index, token);
    m_pending = -1;
    m_positional += m_format.rule(index).value.list ? 0 : 1;
}

void Parser::endPending() {
    if (m_valueDue && m_result.countError()) {
        const Rule& rule = m_format.rule(m_pending);
        report(Problem::MissingValue, {{}, label(rule), expectation(rule.value), {}, 0});
    }
    m_pending = -1;
    m_valueDue = false;
}

void Parser::checkRequired() {
    for (std::size_t i = 0; i < m_format.rules.size(); ++i) {
        const Rule& rule = m_format.rules[i];
        const bool excused = rule.kind == Kind::Positional && m_skipped;
        if (rule.required && m_result.rules[i].count == 0 && !excused && m_result.countError()) {
            const std::string expected = rule.help.empty() ? expectation(rule.value) : rule.help;
            report(Problem::Missing, {{}, usageOf(rule), expected.empty() ? expected : ": " + expected, {}, 0});
        }
    }
}

void Parser::checkOneOfs() {
    for (const OneOf& oneOf : m_format.oneOfs) {
        std::string all;
        std::string given;
        for (const int index : oneOf.rules) {
            const std::string name = label(m_format.rule(index));
            all += (all.empty() ? "" : ", ") + name;
            if (m_result.rules[static_cast<std::size_t>(index)].count == 0) {
                continue;
            }
            if (!given.empty() && m_result.countError()) {
                report(Problem::NotTogether, {{}, given, name, {}, 0});
            }
            given = name;
        }
        if (oneOf.required && given.empty() && m_result.countError()) {
            report(Problem::OneMissing, {{}, {}, all, {}, 0});
        }
    }
}

/// Puts the values of each rule side by side, so that one is found by its number at once.
void Parser::sortValues() {
    std::size_t first = 0;
    for (RuleResult& rule : m_result.rules) {
        rule.firstValue = first;
        first += static_cast<std::size_t>(rule.valueCount);
        rule.valueCount = 0;
    }
    m_result.values.resize(first);
    for (const Given& given : m_given) {
        RuleResult& rule = m_result.rules[static_cast<std::size_t>(given.rule)];
        m_result.values[rule.firstValue + static_cast<std::size_t>(rule.valueCount++)] = given.text;
    }
}

void Parser::report(Problem problem, const Details& details) {
    m_result.errors.push_back(errorText(problem, details));
}

void Parser::reportUnknown(Problem problem, std::string_view token) {
    if (m_result.countError()) {
        report(problem, {token, {}, {}, nearestName(m_format, token.substr(0, token.find('='))), 0});
    }
}

void Parser::reportAmbiguous(std::string_view token) {
    if (!m_result.countError()) {
        return;
    }
    std::string known;
    const std::string_view beginning = token.substr(0, token.find('='));
    for (const Rule& rule : m_format.rules) {
        for (const std::string& name : rule.names) {
            if (equalFolded(std::string_view(name).substr(0, beginning.size()), beginning)) {
                known += (known.empty() ? "" : " or ") + name;
            }
        }
    }
    report(Problem::AmbiguousSwitch, {token, {}, known, {}, 0});
}

void Parser::reportValue(const Rule& rule, std::string_view text) {
    if (m_result.countError()) {
        const bool hasWords = !rule.value.choices.empty();
        report(Problem::BadValue, {text, label(rule), expectation(rule.value),
                                   hasWords ? nearestChoice(rule.value, text) : std::string(), 0});
    }
}

}  // namespace HostKit::cmd
