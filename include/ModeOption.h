/// @file
/// The rows of the file generation's options.
///
/// One row stands for one option: its enumerator, its kind (a Switch or a Text option), the text that stands for it on
/// a command line, and how many rows behind it form a group with it. Enumerator, key text and description all come
/// from here. The order is part of the interface: callers pass row numbers across the library's border.
#pragma once

#include <cstdint>
#include <iterator>

#include "OptionRow.h"

// clang-format off
#define TESSAL_MODE_OPTIONS(ROW) \
    ROW(CF_GENERATE_START, Switch, "", 0)           \
    ROW(CF_ACTIVE_COLLECTION, Text, "-active", 0)   \
    ROW(CF_PATH, Text, "-path", 0)                  \
    ROW(CF_GENERATE_MAX, Switch, "", 0)             \
    ROW(MPM_GENERATE_START, Switch, "", 0)          \
    ROW(MPM_PATH, Text, "-path", 0)                 \
    ROW(MPM_OUTPUT, Text, "-output", 0)             \
    ROW(MPM_COMPRESSED, Switch, "-compressed", 0)   \
    ROW(MPM_GENERATE_MAX, Switch, "", 0)            \
    ROW(PFF_GENERATE_START, Switch, "", 0)          \
    ROW(PFF_PATH, Text, "-path", 0)                 \
    ROW(PFF_OUTPUT, Text, "-output", 0)             \
    ROW(PFF_COMPRESSED, Switch, "-compressed", 0)   \
    ROW(PFF_FORMAT, Text, "-format", 0)             \
    ROW(PFF_FILLVALUE, Text, "-fillValue", 0)       \
    ROW(PFF_DISABLESWAP, Switch, "-disableswap", 0) \
    ROW(PFF_GENERIC, Switch, "-generic", 0)         \
    ROW(PFF_MULTIBOOT, Switch, "-multiboot", 0)     \
    ROW(PFF_GENERATE_MAX, Switch, "", 0)            \
    ROW(IDCODE_LOOP_COUNT, Text, "", 0)
// clang-format on

namespace tESSALNS {

/// The options of file generation; the value is the row, counted from 0.
enum MODE_OPTION : std::int32_t {
#define TESSAL_ENUMERATOR(name, kind, dashValue, groupSize) name,
    TESSAL_MODE_OPTIONS(TESSAL_ENUMERATOR)
#undef TESSAL_ENUMERATOR
};

/// The same rows, in the order of their enumerators.
inline constexpr OptionRow modeOptionRows[] = {
#define TESSAL_ROW(name, kind, dashValue, groupSize) {"MODE_OPTIONS/" #name, OptionKind::kind, dashValue, groupSize},
    TESSAL_MODE_OPTIONS(TESSAL_ROW)
#undef TESSAL_ROW
};
static_assert(std::size(modeOptionRows) == 20, "callers pass row numbers");

}  // namespace tESSALNS
