#include "hostkit/CmdComplete.h"

#include <algorithm>
#include <string>

#include "hostkit/CmdParser.h"
#include "hostkit/CmdValue.h"

namespace HostKit::cmd {
namespace {

class Completion {
public:
    Completion(const Format& format, std::string_view partial) : m_format(format), m_partial(partial) {}

    /// Adds @p head and the word when that goes on from what stands there.
    void offer(std::string_view word, std::string_view head = {}) {
        const std::string whole = std::string(head).append(word);
        if (equalFolded(std::string_view(whole).substr(0, m_partial.size()), m_partial)) {
            m_words.emplace_back(std::string_view(whole));
        }
    }

    void offerChoices(int rule, std::string_view head = {}) {
        for (const std::string& choice : m_format.rule(rule).value.choices) {
            offer(choice, head);
        }
    }

    void offerNames(const Result& result) {
        for (std::size_t i = 0; i < m_format.rules.size(); ++i) {
            const Rule& rule = m_format.rules[i];
            const bool isFree =
                rule.repeated || (result.rules[i].count == 0 && !isExcluded(static_cast<int>(i), result));
            if (rule.kind != Kind::Positional && isFree) {
                for (const std::string& name : rule.names) {
                    offer(name);
                }
            }
        }
    }

    std::vector<HkString>& words() { return m_words; }

private:
    /// Whether another rule was given that excludes this one.
    bool isExcluded(int rule, const Result& result) const {
        const auto excludes = [&](const OneOf& oneOf) {
            return std::find(oneOf.rules.begin(), oneOf.rules.end(), rule) != oneOf.rules.end() &&
                   std::any_of(oneOf.rules.begin(), oneOf.rules.end(),
                               [&](int other) { return result.rules[static_cast<std::size_t>(other)].count > 0; });
        };
        return m_format.rule(rule).inOneOf && std::any_of(m_format.oneOfs.begin(), m_format.oneOfs.end(), excludes);
    }

    const Format& m_format;
    std::string_view m_partial;
    std::vector<HkString> m_words;
};

}  // namespace

std::vector<HkString> complete(const Format& format, const char* const* arguments, std::size_t count,
                               std::string_view partial) {
    Result result;
    Parser parser(format, true, result);
    parser.walk(arguments, count);
    Completion completion(format, partial);
    const std::size_t equal = partial.find('=');
    const bool isSwitch = !partial.empty() && partial[0] == '-' && !parser.haveSwitchesEnded();
    if (isSwitch && equal != std::string_view::npos) {
        const int rule = format.find(partial.substr(0, equal));
        if (rule >= 0) {
            completion.offerChoices(rule, partial.substr(0, equal + 1));
        }
        return std::move(completion.words());
    }
    const int value = parser.pendingRule() >= 0 ? parser.pendingRule() : parser.nextPositional();
    if (value >= 0) {
        completion.offerChoices(value);
    }
    if (!parser.isValueDue() && !parser.haveSwitchesEnded()) {
        completion.offerNames(result);
    }
    return std::move(completion.words());
}

}  // namespace HostKit::cmd
