// Memory of many pages.
#pragma once

#include <cstddef>

namespace platform {

/// Asks the host to back memory that is about to be filled by large pages where it has them: being told of every small
/// page can cost a host more than filling it. A hint, for memory of any origin and size.
void preferLargePages(void* memory, std::size_t size);

}  // namespace platform
