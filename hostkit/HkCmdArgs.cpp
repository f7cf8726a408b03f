#include "HkCmdArgs.h"

#include <cstring>
#include <string>
#include <utility>

#include "hostkit/CmdComplete.h"
#include "hostkit/CmdErrors.h"
#include "hostkit/CmdFormat.h"
#include "hostkit/CmdParser.h"
#include "hostkit/CmdUsage.h"
#include "hostkit/CmdValue.h"
#include "s/UnitOrigin.h"

namespace HostKit {
namespace {

constexpr UnitOrigin origin{"../s/HkCmdArgs", "$Revision: 1.1 $"};

HkString toHkString(std::string_view text) {
    return HkString(text);
}

std::vector<HkString> toHkStrings(const std::vector<std::string>& texts) {
    std::vector<HkString> result;
    result.reserve(texts.size());
    for (const std::string& text : texts) {
        result.push_back(toHkString(text));
    }
    return result;
}

std::string malformedText(const cmd::Format& format) {
    return cmd::errorText(cmd::Problem::MalformedFormat, {{}, {}, format.error, {}, format.errorOffset + 1});
}

/// The arguments of a command, copied into one block; null entries stay null.
struct Tokens {
    std::vector<const char*> texts;
    std::unique_ptr<char[]> block;

    Tokens(int argc, const char* const* argv) {
        if (argc <= 0 || argv == nullptr) {
            return;
        }
        const auto count = static_cast<std::size_t>(argc);
        texts.resize(count);
        std::vector<std::size_t> sizes(count);
        std::size_t total = 0;
        for (std::size_t i = 0; i < count; ++i) {
            sizes[i] = argv[i] != nullptr ? std::strlen(argv[i]) + 1 : 0;
            total += sizes[i];
        }
        block.reset(new char[total]);
        char* next = block.get();
        for (std::size_t i = 0; i < count; ++i) {
            if (sizes[i] > 0) {
                std::memcpy(next, argv[i], sizes[i]);
                texts[i] = next;
                next += sizes[i];
            }
        }
    }

    bool hasCommand() const { return !texts.empty() && texts[0] != nullptr; }
};

}  // namespace

struct HkCmdArgs::State {
    State(int argc, const char* const* argv, const char* text)
        : tokens(argc, argv), format(cmd::compile(text)), hasFormat(text != nullptr) {}

    void parse(bool abbreviations) {
        if (!hasFormat) {
            addError(cmd::errorText(cmd::Problem::NoFormat, {}));
            return;
        }
        if (format->isMalformed()) {
            addError(malformedText(*format));
            return;
        }
        if (!tokens.hasCommand()) {
            addError(cmd::errorText(cmd::Problem::NoCommand, {}));
            return;
        }
        cmd::Parser parser(*format, abbreviations, result);
        parser.walk(tokens.texts.data() + 1, tokens.texts.size() - 1);
        parser.finish();
    }

    void addError(std::string text) {
        ++result.errorCount;
        result.errors.push_back(std::move(text));
    }

    const char* command() const { return tokens.hasCommand() ? tokens.texts[0] : ""; }

    void report(bool withUsage) const {
        const std::string prefix = cmd::printable(command()) + ": ";
        for (const std::string& text : result.errors) {
            origin.report().issueInfo("%s%s\n", prefix.c_str(), text.c_str());
        }
        const auto shown = static_cast<int>(result.errors.size());
        if (result.errorCount > shown) {
            const auto more = static_cast<std::size_t>(result.errorCount - shown);
            origin.report().issueInfo("%s%s\n", prefix.c_str(),
                                      cmd::errorText(cmd::Problem::MoreErrors, {{}, {}, {}, {}, more}).c_str());
        }
        if (withUsage && hasFormat && !format->isMalformed()) {
            origin.report().issueInfo("%s\n", cmd::usageLine(*format, cmd::printable(command()).c_str()).c_str());
        }
    }

    const cmd::RuleResult* find(const char* name, const cmd::Rule** rule = nullptr) const {
        const int index = name != nullptr ? format->find(name) : -1;
        if (index < 0 || result.rules.empty()) {
            return nullptr;
        }
        if (rule != nullptr) {
            *rule = &format->rule(index);
        }
        return &result.rules[static_cast<std::size_t>(index)];
    }

    /// The value as it was given, null when there is none; @p rule gets its rule.
    const char* value(const char* name, int index, const cmd::Rule** rule = nullptr) const {
        const cmd::RuleResult* const found = find(name, rule);
        if (found == nullptr || index < 0 || index >= found->valueCount) {
            return nullptr;
        }
        return result.values[found->firstValue + static_cast<std::size_t>(index)];
    }

    /// The words of a group value; empty where it is none.
    std::vector<cmd::GroupWord> group(const char* name, int index) const {
        std::vector<cmd::GroupWord> words;
        const cmd::Rule* rule = nullptr;
        const char* const given = value(name, index, &rule);
        if (given == nullptr || rule->value.type != cmd::Type::Group || !splitGroup(rule->value, given, words)) {
            words.clear();
        }
        return words;
    }

    Tokens tokens;
    std::shared_ptr<const cmd::Format> format;
    bool hasFormat;
    cmd::Result result;
};

HkCmdArgs::HkCmdArgs(int argc, const char* const* argv, const char* format, void (*callback)(), unsigned short flags)
    : m_state(std::make_unique<State>(argc, argv, format)) {
    static_assert(sizeof(HkCmdArgs) == sizeof(void*), "callers count on one pointer");
    m_state->parse((flags & NoAbbreviation) == 0);
    if (m_state->result.errorCount == 0) {
        return;
    }
    if ((flags & Quiet) == 0) {
        m_state->report((flags & NoUsage) == 0);
    }
    if (callback != nullptr) {
        callback();
    }
}

HkCmdArgs::~HkCmdArgs() = default;

unsigned char HkCmdArgs::iserror() const {
    return m_state->result.errorCount > 0 ? 1 : 0;
}

int HkCmdArgs::errorCount() const {
    return m_state->result.errorCount;
}

std::vector<HkString> HkCmdArgs::errors() const {
    return toHkStrings(m_state->result.errors);
}

const char* HkCmdArgs::command() const {
    return m_state->command();
}

const char* HkCmdArgs::formatText() const {
    return m_state->format->text.c_str();
}

bool HkCmdArgs::isGiven(const char* name) const {
    return count(name) > 0;
}

int HkCmdArgs::count(const char* name) const {
    const cmd::RuleResult* const found = m_state->find(name);
    return found != nullptr ? found->count : 0;
}

int HkCmdArgs::valueCount(const char* name) const {
    const cmd::RuleResult* const found = m_state->find(name);
    return found != nullptr ? found->valueCount : 0;
}

const char* HkCmdArgs::text(const char* name, int index, const char* fallback) const {
    const cmd::Rule* rule = nullptr;
    const char* const given = m_state->value(name, index, &rule);
    if (given == nullptr) {
        return fallback;
    }
    const bool isChoice = rule->value.type == cmd::Type::Choice;
    const std::string* const choice = isChoice ? cmd::findChoice(rule->value.choices, given) : nullptr;
    return choice != nullptr ? choice->c_str() : given;
}

std::int64_t HkCmdArgs::integer(const char* name, int index, std::int64_t fallback) const {
    const char* const given = m_state->value(name, index);
    std::int64_t number = 0;
    return given != nullptr && cmd::readInteger(given, number) ? number : fallback;
}

std::uint64_t HkCmdArgs::hex(const char* name, int index, std::uint64_t fallback) const {
    const char* const given = m_state->value(name, index);
    std::uint64_t number = 0;
    return given != nullptr && cmd::readHex(given, number) ? number : fallback;
}

std::vector<HkString> HkCmdArgs::list(const char* name) const {
    std::vector<HkString> values;
    const int count = valueCount(name);
    values.reserve(static_cast<std::size_t>(count));
    for (int i = 0; i < count; ++i) {
        values.emplace_back(text(name, i));
    }
    return values;
}

HkString HkCmdArgs::groupLeader(const char* name, int index) const {
    const std::vector<cmd::GroupWord> words = m_state->group(name, index);
    return words.empty() ? HkString() : toHkString(words.front().name);
}

bool HkCmdArgs::groupHas(const char* name, const char* member, int index) const {
    const std::vector<cmd::GroupWord> words = m_state->group(name, index);
    for (std::size_t i = 1; member != nullptr && i < words.size(); ++i) {
        if (cmd::equalFolded(words[i].name, member)) {
            return true;
        }
    }
    return false;
}

HkString HkCmdArgs::groupText(const char* name, const char* member, int index) const {
    const std::vector<cmd::GroupWord> words = m_state->group(name, index);
    for (std::size_t i = 1; member != nullptr && i < words.size(); ++i) {
        if (cmd::equalFolded(words[i].name, member)) {
            return toHkString(words[i].text);
        }
    }
    return {};
}

std::vector<HkString> HkCmdArgs::order() const {
    std::vector<HkString> names;
    names.reserve(m_state->result.order.size());
    for (const int rule : m_state->result.order) {
        names.push_back(toHkString(m_state->format->rule(rule).names.front()));
    }
    return names;
}

HkString HkCmdArgs::usage(const char* command, const char* format) {
    return toHkString(cmd::usageLine(*cmd::compile(format), command != nullptr ? command : ""));
}

HkString HkCmdArgs::help(const char* command, const char* format) {
    return toHkString(cmd::helpText(*cmd::compile(format), command != nullptr ? command : ""));
}

HkString HkCmdArgs::description(const char* format) {
    return toHkString(cmd::compile(format)->help);
}

std::vector<HkString> HkCmdArgs::complete(int argc, const char* const* argv, const char* format) {
    const std::shared_ptr<const cmd::Format> compiled = cmd::compile(format);
    if (argc < 2 || argv == nullptr || compiled->isMalformed()) {
        return {};
    }
    const char* const last = argv[argc - 1];
    return cmd::complete(*compiled, argv + 1, static_cast<std::size_t>(argc) - 2, last != nullptr ? last : "");
}

std::vector<HkCmdArgInfo> HkCmdArgs::describe(const char* format) {
    const std::shared_ptr<const cmd::Format> compiled = cmd::compile(format);
    std::vector<HkCmdArgInfo> infos;
    if (compiled->isMalformed()) {
        return infos;
    }
    for (const cmd::Rule& rule : compiled->rules) {
        HkCmdArgInfo info;
        info.kind = rule.kind;
        info.names = toHkStrings(rule.names);
        info.type = rule.value.type;
        info.valueName = toHkString(rule.value.name);
        info.expected = toHkString(cmd::expectation(rule.value));
        info.choices = toHkStrings(rule.value.choices);
        info.required = rule.required;
        info.repeated = rule.repeated;
        info.list = rule.value.list;
        info.valueOptional = rule.value.optional;
        info.help = toHkString(rule.help);
        infos.push_back(std::move(info));
    }
    return infos;
}

HkString HkCmdArgs::checkFormat(const char* format) {
    if (format == nullptr) {
        return toHkString(cmd::errorText(cmd::Problem::NoFormat, {}));
    }
    const std::shared_ptr<const cmd::Format> compiled = cmd::compile(format);
    return compiled->isMalformed() ? toHkString(malformedText(*compiled)) : HkString();
}

const char* HkCmdArgs::nearest(const char* word, const std::vector<HkString>& words) {
    cmd::NearestWord nearest(word != nullptr ? word : "");
    for (const HkString& candidate : words) {
        nearest.consider(candidate.view());
    }
    return nearest.word().empty() ? nullptr : nearest.word().data();
}

}  // namespace HostKit
