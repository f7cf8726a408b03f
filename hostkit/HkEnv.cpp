#include "HkEnv.h"

#include <cstdlib>

namespace HostKit {

const char* HkEnv::GetEnv(const char* name) {
    return name != nullptr ? std::getenv(name) : nullptr;
}

}  // namespace HostKit
