/// @file
/// Where the data files are looked for.
#pragma once

#include "TessalExport.h"

namespace DeviceProfile {

/// Names the directories in which data files are looked for, in that order, for the whole process.
///
/// @param directories UTF-8, separated as `PATH` is on the host (`:` on Linux, `;` on Windows); empty members are
///        skipped. The text is copied. Null or a list without a directory: forget what was set.
///
/// Without a list that is set here, the environment variable `TESSAL_DATA_PATH` gives one in the same form; without
/// that, the data directory installed beside the library is taken. The first source that is set is the only one. May
/// be called at any time from any thread; files that are open stay as they are.
TESSAL_API void setDataPath(const char* directories);

}  // namespace DeviceProfile
