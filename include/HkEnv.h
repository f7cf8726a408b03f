/// @file
/// Access to the environment.
#pragma once

#include "TessalExport.h"

namespace HostKit {

class TESSAL_API HkEnv {
public:
    /// The value of the variable @p name, or null when it is not set. The caller does not own the value; it stays
    /// good until the environment changes. A null name gives null.
    static const char* GetEnv(const char* name);
};

}  // namespace HostKit

using HostKit::HkEnv;
