// How a format reads to the user: labels, usage line, help.
#pragma once

#include <string>

#include "hostkit/CmdFormat.h"

namespace HostKit::cmd {

/// The rule as messages name it: "-p|-position", "<file>" or "erase".
std::string label(const Rule& rule);
/// The rule with its value, without the brackets of the usage line: "-u <code>".
std::string bareUsage(const Rule& rule);
std::string usageLine(const Format& format, const char* command);
std::string helpText(const Format& format, const char* command);

}  // namespace HostKit::cmd
