/// @file
/// The modes of the tool, which the library carries for its callers.
#pragma once

#include <cstdint>

namespace tESSALNS {

/// Mode of the tool. The numbers are the caller's; the library knows only the one that stands for none.
enum MODE_TYPE : std::int32_t { MODE_NONE = 9 };

/// Submode of the tool; likewise.
enum SUBMODE_TYPE : std::int32_t { SUBMODE_NONE = 7 };

}  // namespace tESSALNS
