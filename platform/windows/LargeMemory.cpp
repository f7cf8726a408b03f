#include "platform/LargeMemory.h"

namespace platform {

// Large pages need a privilege that users do not have.
void preferLargePages(void*, std::size_t) {}

}  // namespace platform
