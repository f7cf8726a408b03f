// The texts of what can be wrong with a command's arguments.
#pragma once

#include <cstddef>
#include <string>
#include <string_view>
#include <vector>

namespace HostKit::cmd {

enum class Problem {
    MalformedFormat,
    NoCommand,
    NullArgument,
    UnknownSwitch,
    AmbiguousSwitch,
    UnexpectedArgument,
    MissingValue,
    BadValue,
    NoValueTaken,
    GivenTwice,
    Missing,
    NotTogether,
    OneMissing,
    MoreErrors
};

/// What the texts name; each text uses those that it needs.
struct Details {
    std::string_view argument;  ///< as the user wrote it
    std::string name;           ///< of the switch or argument, as the usage line has it
    std::string expected;
    std::string nearest;  ///< the known word to suggest, empty for none
    std::size_t number = 0;
};

/// The text of one error, without command word and line end.
std::string errorText(Problem problem, const Details& details);

/// A user's text for a message: control characters escaped, cut where it is very long.
std::string printable(std::string_view text);

/// The number of single-character edits (insert, remove, replace, swap neighbours) between two words without regard
/// to case; any number above @p limit when there are more. Takes length times limit steps.
std::size_t editDistance(std::string_view a, std::string_view b, std::size_t limit);

/// Finds the nearest of the words shown to it, none farther than a third of the wanted word's length.
class NearestWord {
public:
    explicit NearestWord(std::string_view wanted);
    void consider(std::string_view candidate);
    /// Empty when no candidate was near enough; views the candidate.
    std::string_view word() const { return m_word; }

private:
    std::string_view m_wanted;
    std::string_view m_word;
    std::size_t m_limit;
};

}  // namespace HostKit::cmd
