// Values of arguments: what fits, and how it reads.
#pragma once

#include <cstdint>
#include <string>
#include <string_view>
#include <vector>

#include "hostkit/CmdFormat.h"

namespace HostKit::cmd {

/// The whole text as a number: a sign, then decimal digits, or 0x and hexadecimal ones. False when it is none or
/// does not fit into 64 bits.
bool readInteger(std::string_view text, std::int64_t& number);
/// The whole text as hexadecimal digits, with or without 0x. False when it is none or has more than 16 significant.
bool readHex(std::string_view text, std::uint64_t& number);

/// One word of a group value: "customercode:1234" has a text, "rp" has none.
struct GroupWord {
    std::string_view name;
    std::string_view text;
};

/// Splits "0 rp customercode:1234" into its words, the first one being the leader. Names are as the format spells
/// them. False when a word is not one that the value knows.
bool splitGroup(const Value& value, std::string_view text, std::vector<GroupWord>& words);

/// Whether the text is such a value.
bool fits(const Value& value, std::string_view text);
/// The value in words, such as "an integer from 1 to 255".
std::string expectation(const Value& value);
/// The choice as the format spells it, null when the text is none.
const std::string* findChoice(const std::vector<std::string>& choices, std::string_view text);
/// Equal without regard to case.
bool equalFolded(std::string_view a, std::string_view b);

}  // namespace HostKit::cmd
