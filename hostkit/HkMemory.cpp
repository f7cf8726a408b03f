#include "HkMemory.h"

#include <algorithm>
#include <cstdlib>

namespace HostKit {
namespace {

constexpr std::size_t smallest = 1;  // size 0 means different things to different hosts

}  // namespace

void* hk_malloc(std::size_t size) {
    return std::malloc(std::max(size, smallest));
}

void* hk_realloc(void* pointer, std::size_t size) {
    return std::realloc(pointer, std::max(size, smallest));
}

void hk_free(void* pointer) {
    std::free(pointer);
}

}  // namespace HostKit
