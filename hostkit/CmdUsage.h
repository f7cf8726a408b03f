// How a format reads to the user: labels, usage line, help.
#pragma once

#include <string>

#include "hostkit/CmdFormat.h"

namespace HostKit::cmd {

/// The rule as messages name it: "-p|-position", "<file>" or "erase".
std::string label(const Rule& rule);
/// The rule with its value, brackets and dots, as the usage line has it: "[-u <code>]".
std::string usageOf(const Rule& rule);
std::string usageLine(const Format& format, const char* command);
std::string helpText(const Format& format, const char* command);

}  // namespace HostKit::cmd
