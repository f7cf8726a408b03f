// The compiled form of an argument format. docs/argument-format.md tells the text form.
#pragma once

#include <cstddef>
#include <cstdint>
#include <limits>
#include <memory>
#include <string>
#include <string_view>
#include <vector>

#include "HkCmdArgs.h"

namespace HostKit::cmd {

using Kind = HkCmdArgInfo::Kind;
using Type = HkCmdArgInfo::Type;

/// A word of a group value behind its first one; with text it is written "name:text".
struct Member {
    std::string name;
    bool hasText = false;
};

/// What a value must be.
struct Value {
    Type type = Type::None;
    std::string name;
    /// Bounds of an integer, or of the number of digits or characters of a hex number or text.
    std::int64_t low = std::numeric_limits<std::int64_t>::min();
    std::int64_t high = std::numeric_limits<std::int64_t>::max();
    std::vector<std::string> choices;  ///< of a choice; the first words of a group
    std::vector<Member> members;       ///< of a group
    bool optional = false;
    bool list = false;
};

/// One switch, word or positional argument.
struct Rule {
    Kind kind = Kind::Switch;
    std::vector<std::string> names;
    Value value;
    bool required = false;
    bool repeated = false;
    bool inOneOf = false;
    std::string help;
};

/// Rules of which one may be given, or must be.
struct OneOf {
    std::vector<int> rules;
    bool required = false;
};

/// A name by which a rule is found, in lower case.
struct Name {
    std::string folded;
    int rule = 0;
    std::size_t offset = 0;  ///< where it stands in the format text
};

/// The outcome of looking a token up among the switches.
struct Match {
    int rule = -1;           ///< -1: none
    bool ambiguous = false;  ///< short for several
};

struct Format {
    std::string text;
    std::string help;
    std::vector<Rule> rules;
    std::vector<OneOf> oneOfs;
    std::vector<int> positionals;
    std::vector<Name> names;  ///< sorted
    std::string error;        ///< empty when the format is well-formed
    std::size_t errorOffset = 0;

    bool isMalformed() const { return !error.empty(); }
    const Rule& rule(int index) const { return rules[static_cast<std::size_t>(index)]; }
    /// The rule of this name without regard to case, -1 when there is none.
    int find(std::string_view name) const;
    /// The switch that the token abbreviates: its beginning, a dash and at least one more character.
    Match findAbbreviated(std::string_view token) const;
};

/// Compiles a text, or gives the compiled form of an equal text seen before. Never null; safe from several threads.
std::shared_ptr<const Format> compile(const char* text);

/// Reads the text into @p format; on failure `error` and `errorOffset` tell.
void readFormat(Format& format);

}  // namespace HostKit::cmd
