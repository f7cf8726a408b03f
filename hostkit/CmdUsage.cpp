#include "hostkit/CmdUsage.h"

#include <algorithm>

#include "hostkit/CmdValue.h"

namespace HostKit::cmd {
namespace {

constexpr std::size_t widestColumn = 32;

std::string valueUsage(const Value& value) {
    const std::string text = "<" + value.name + ">" + (value.list ? "..." : "");
    return value.optional ? "[" + text + "]" : text;
}

/// The rule with brackets and dots: "[-u <code>]".
std::string usageOf(const Rule& rule) {
    const std::string text = bareUsage(rule);
    std::string bracketed = rule.required ? text : "[" + text + "]";
    if (!rule.repeated) {
        return bracketed;
    }
    return (rule.required ? "(" + text + ")" : bracketed) + "...";
}

const OneOf* oneOfBeginningWith(const Format& format, int rule) {
    const auto found = std::find_if(format.oneOfs.begin(), format.oneOfs.end(),
                                    [rule](const OneOf& oneOf) { return oneOf.rules.front() == rule; });
    return found != format.oneOfs.end() ? &*found : nullptr;
}

std::string oneOfUsage(const Format& format, const OneOf& oneOf) {
    std::string text;
    for (const int rule : oneOf.rules) {
        text += (text.empty() ? "" : " | ") + bareUsage(format.rule(rule));
    }
    return oneOf.required ? "{" + text + "}" : "[" + text + "]";
}

/// Help and what the value must be, for the right column.
std::string explanation(const Rule& rule) {
    std::string expected = expectation(rule.value);
    if (expected == "a text") {
        expected.clear();  // goes without saying
    }
    if (rule.help.empty() || expected.empty()) {
        return rule.help + expected;
    }
    return rule.help + " (" + expected + ")";
}

}  // namespace

std::string label(const Rule& rule) {
    if (rule.kind == Kind::Positional) {
        return "<" + rule.names.front() + ">";
    }
    if (rule.names.front().empty()) {
        return "\"\"";
    }
    std::string text;
    for (const std::string& name : rule.names) {
        text += (text.empty() ? "" : "|") + name;
    }
    return text;
}

std::string bareUsage(const Rule& rule) {
    if (rule.kind == Kind::Positional) {
        return valueUsage(rule.value);
    }
    return rule.value.type == Type::None ? label(rule) : label(rule) + " " + valueUsage(rule.value);
}

std::string usageLine(const Format& format, const char* command) {
    std::string text = std::string("usage: ") + command;
    for (std::size_t i = 0; i < format.rules.size(); ++i) {
        const Rule& rule = format.rules[i];
        if (!rule.inOneOf) {
            text += " " + usageOf(rule);
        } else if (const OneOf* const oneOf = oneOfBeginningWith(format, static_cast<int>(i))) {
            text += " " + oneOfUsage(format, *oneOf);
        }
    }
    return text;
}

std::string helpText(const Format& format, const char* command) {
    std::string text = usageLine(format, command) + "\n";
    if (!format.help.empty()) {
        text += "\n" + format.help + "\n";
    }
    std::size_t column = 0;
    for (const Rule& rule : format.rules) {
        const std::size_t width = bareUsage(rule).size();
        column = width <= widestColumn ? std::max(column, width) : column;
    }
    text += format.rules.empty() ? "" : "\n";
    for (const Rule& rule : format.rules) {
        const std::string left = "  " + bareUsage(rule);
        const std::string right = explanation(rule);
        text += left;
        if (!right.empty()) {
            // A left side that is too wide stands in a line of its own.
            const bool isWide = left.size() > column + 2;
            text += isWide ? "\n" + std::string(column + 4, ' ') : std::string(column + 4 - left.size(), ' ');
            text += right;
        }
        text += "\n";
    }
    return text;
}

}  // namespace HostKit::cmd
