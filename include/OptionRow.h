/// @file
/// The rows of an option table as constants.
#pragma once

namespace tESSALNS {

enum class OptionKind { Switch, Text };

/// One option: what its description in an option manager is made from.
struct OptionRow {
    const char* key;
    OptionKind kind;
    const char* dashValue;  ///< the text that stands for the option on a command line
    int groupSize;          ///< how many rows directly behind this one form a group with it

    constexpr bool isSwitch() const { return kind == OptionKind::Switch; }
};

/// The rows of one operation: from @p first up to but not including @p last.
struct OptionRange {
    int first;
    int last;
};

}  // namespace tESSALNS
