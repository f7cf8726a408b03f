/// @file
/// Raw memory of the usual allocator shape.
#pragma once

#include <cstddef>

#include "TessalExport.h"

namespace HostKit {

/// A block of @p size bytes, or null when there is none to be had. A size of 0 gives a block too. The caller releases
/// it with hk_free.
TESSAL_API void* hk_malloc(std::size_t size);

/// Gives the block another size, where it is or somewhere else, keeping its content up to the smaller size. Null when
/// that fails: the old block is then good as before. A null pointer gets a new block; size 0 keeps a block.
TESSAL_API void* hk_realloc(void* pointer, std::size_t size);

/// Releases a block of hk_malloc or hk_realloc; null is left alone.
TESSAL_API void hk_free(void* pointer);

}  // namespace HostKit

using HostKit::hk_free;
using HostKit::hk_malloc;
using HostKit::hk_realloc;
