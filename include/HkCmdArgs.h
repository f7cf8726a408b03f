/// @file
/// The parser of a command's arguments.
#pragma once

#include <cstdint>
#include <memory>
#include <vector>

#include "HkString.h"
#include "TessalExport.h"

namespace HostKit {

/// What a format says about one switch, word or positional argument; for shells, editors and documentation.
struct HkCmdArgInfo {
    enum class Kind { Switch, Word, Positional };
    enum class Type { None, Text, Integer, Hex, File, Choice, Group };

    Kind kind = Kind::Switch;
    std::vector<HkString> names;    ///< a switch with its aliases, dashes included; a word; a positional's name
    Type type = Type::None;         ///< None where there is no value
    HkString valueName;             ///< as it stands between the angle brackets; empty where there is no value
    HkString expected;              ///< the value in words, such as "an integer from 1 to 255"
    std::vector<HkString> choices;  ///< of a choice; the first words of a group
    bool required = false;
    bool repeated = false;       ///< the switch or word may be given several times
    bool list = false;           ///< takes several values in a row
    bool valueOptional = false;  ///< the switch may be given without its value
    HkString help;
};

/// Parses the arguments of one command against a format text, and answers what was given.
///
///     const HkCmdArgs args(argc, argv, "-p|-position <device=int 1..255>... [-e|-erase] [-u <code=hex 1..8>]",
///                          nullptr, 0);
///     if (args.iserror() == 0 && args.isGiven("-e")) { ... args.integer("-p", 2) ... }
///
/// docs/argument-format.md tells the format. Arguments are parsed at construction, in time linear in their length.
/// Whatever does not fit is reported as information messages, up to a limit, and closed by the usage line; a format
/// that is itself malformed is reported with place and reason. The object owns copies of all texts, so `argv` and
/// `format` may go afterwards; texts that it hands out live as long as it does. One object may be read by several
/// threads at a time.
///
/// The name that an accessor takes is a switch or any of its aliases with the dash ("-p", "-position"), a word as it
/// is written, or the name of a positional argument without its brackets; case does not count. A name that the
/// format does not hold, null, or an index out of range answers like an argument that was not given.
class TESSAL_API HkCmdArgs {
public:
    /// Values for `flags`; others are ignored.
    enum Flag : unsigned short {
        Quiet = 1,           ///< collect errors without reporting them
        NoAbbreviation = 2,  ///< switches must be written out
        NoUsage = 4          ///< report errors without the usage line behind them
    };

    /// Parses at once. Element 0 of @p argv is the command word.
    /// @param callback called once, behind the messages, when the arguments do not fit; null for none
    HkCmdArgs(int argc, const char* const* argv, const char* format, void (*callback)(), unsigned short flags);
    ~HkCmdArgs();
    HkCmdArgs(const HkCmdArgs&) = delete;
    HkCmdArgs& operator=(const HkCmdArgs&) = delete;

    /// Non-zero when the arguments did not fit the format, or the format is malformed. What was understood can be
    /// read all the same.
    unsigned char iserror() const;
    /// The number of errors, those past the limit of texts included.
    int errorCount() const;
    /// The texts of the errors as they were reported, at most ten.
    std::vector<HkString> errors() const;

    /// The command word; empty when there was none.
    const char* command() const;
    /// Whether the switch, word or positional argument was given.
    bool isGiven(const char* name) const;
    /// How many times it was given.
    int count(const char* name) const;
    /// How many values were given to it, over all its places.
    int valueCount(const char* name) const;

    /// A value as text. A choice reads as the format spells it; a group as it was given.
    const char* text(const char* name, int index = 0, const char* fallback = nullptr) const;
    /// A value as integer: decimal or, with 0x, hexadecimal, signed. The fallback where it is no such number.
    std::int64_t integer(const char* name, int index = 0, std::int64_t fallback = 0) const;
    /// A value as hexadecimal number of up to 16 significant digits, with or without 0x.
    std::uint64_t hex(const char* name, int index = 0, std::uint64_t fallback = 0) const;
    /// All values in order.
    std::vector<HkString> list(const char* name) const;

    /// The first word of a group value: "0" of "0 rp customercode:1234". Empty where it is none.
    HkString groupLeader(const char* name, int index = 0) const;
    /// Whether a group value holds the member: "rp" of the same.
    bool groupHas(const char* name, const char* member, int index = 0) const;
    /// The text behind the colon of a group's member: "1234" of "customercode". Empty where it is none.
    HkString groupText(const char* name, const char* member, int index = 0) const;

    /// What was given, in its order: a switch by its first name, a word, or a positional argument's name.
    std::vector<HkString> order() const;

    /// The usage line, without line end: "usage: program -p|-position <device>... [-e|-erase]".
    HkString usage() const { return usage(command(), formatText()); }
    /// Usage line, description and one line for each argument; lines end in a line feed.
    HkString help() const { return help(command(), formatText()); }
    static HkString usage(const char* command, const char* format);
    static HkString help(const char* command, const char* format);
    /// What the command does, the first help text of the format; empty where there is none.
    static HkString description(const char* format);

    /// The words that may stand in the last place of @p argv, which begin with what stands there already: choices
    /// where a value is due, else the switches and words that may still be given. Sorted as the format has them.
    static std::vector<HkString> complete(int argc, const char* const* argv, const char* format);
    /// The arguments of a format in its order; empty where it is malformed.
    static std::vector<HkCmdArgInfo> describe(const char* format);
    /// What is wrong with a format, with place and reason; the empty text when nothing is.
    static HkString checkFormat(const char* format);
    /// The nearest of the words by edit distance without regard to case; null when all differ from @p word by more
    /// than a third of its length. For suggestions in the style of the parser's own.
    static const char* nearest(const char* word, const std::vector<HkString>& words);

private:
    struct State;

    const char* formatText() const;

    std::unique_ptr<State> m_state;
};

}  // namespace HostKit

using HostKit::HkCmdArgInfo;
using HostKit::HkCmdArgs;
