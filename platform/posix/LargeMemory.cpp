#include "platform/LargeMemory.h"

#include <sys/mman.h>

#include <cstdint>

namespace platform {

void preferLargePages(void* memory, std::size_t size) {
#ifdef MADV_HUGEPAGE
    constexpr std::uintptr_t largePage = std::uintptr_t{2} << 20;
    const auto address = reinterpret_cast<std::uintptr_t>(memory);
    const std::uintptr_t first = (address + largePage - 1) / largePage * largePage;
    const std::uintptr_t last = (address + size) / largePage * largePage;
    if (first < last) {
        ::madvise(static_cast<char*>(memory) + (first - address), last - first, MADV_HUGEPAGE);
    }
#endif
}

}  // namespace platform
