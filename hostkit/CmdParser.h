// The walk over a command's arguments.
#pragma once

#include <cstddef>
#include <string>
#include <string_view>
#include <vector>

#include "hostkit/CmdErrors.h"
#include "hostkit/CmdFormat.h"

namespace HostKit::cmd {

/// How often a rule was met, and where its values stand.
struct RuleResult {
    int count = 0;
    int valueCount = 0;
    std::size_t firstValue = 0;
};

struct Result {
    std::vector<RuleResult> rules;    ///< one for each rule of the format
    std::vector<int> order;           ///< the rules in the order in which they were met
    std::vector<const char*> values;  ///< rule by rule, each rule's in order
    std::vector<std::string> errors;  ///< the texts of the first ones
    int errorCount = 0;

    static constexpr int keptErrors = 10;

    /// Counts an error; true while its text is wanted.
    bool countError() { return ++errorCount <= keptErrors; }
};

/// Walks once over the arguments of a command, whose texts must outlive the result.
class Parser {
public:
    Parser(const Format& format, bool abbreviations, Result& result);

    /// Takes the arguments behind the command word; entries may be null.
    void walk(const char* const* arguments, std::size_t count);
    /// Reports what is missing or excluded, and orders the values by rule.
    void finish();

    // Where the walk stands, for completion.
    int pendingRule() const { return m_pending; }       ///< whose value may come next, -1 for none
    bool isValueDue() const { return m_valueDue; }      ///< it must come
    bool haveSwitchesEnded() const { return m_ended; }  ///< behind "--"
    int nextPositional() const;                         ///< the rule of the next plain argument, -1 for none

private:
    struct Given {
        int rule;
        const char* text;
    };

    void take(const char* token, std::size_t place);
    bool takeSwitch(const char* token, std::string_view view);
    Match findSwitch(const char* token, std::string_view view, const char*& attached) const;
    void beginRule(int rule, const char* attached);
    void takeValue(int rule, const char* text);
    void takeOperand(const char* token, std::string_view view);
    void endPending();

    void checkRequired();
    void checkOneOfs();
    void sortValues();

    void report(Problem problem, const Details& details);
    void reportUnknown(Problem problem, std::string_view token);
    void reportAmbiguous(std::string_view token);
    void reportValue(const Rule& rule, std::string_view text);

    const Format& m_format;
    Result& m_result;
    std::vector<Given> m_given;
    std::size_t m_positional = 0;  // how many positional arguments are filled
    int m_pending = -1;
    bool m_valueDue = false;
    bool m_abbreviations;
    bool m_ended = false;
    bool m_skipping = false;  // behind an unknown switch: what follows is likely its values
    bool m_skipped = false;   // something was passed over, which may be what is missing elsewhere
};

}  // namespace HostKit::cmd
