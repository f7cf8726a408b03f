// What may stand in the last place of a command.
#pragma once

#include <cstddef>
#include <string_view>
#include <vector>

#include "HkString.h"
#include "hostkit/CmdFormat.h"

namespace HostKit::cmd {

/// The words that go on from @p partial behind the @p count arguments; see HkCmdArgs::complete.
std::vector<HkString> complete(const Format& format, const char* const* arguments, std::size_t count,
                               std::string_view partial);

}  // namespace HostKit::cmd
