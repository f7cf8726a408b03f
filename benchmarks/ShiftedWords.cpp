#include "ShiftedWords.h"

#include <cstring>

namespace BitSets {

#if defined(__x86_64__) && defined(__GNUC__)
__attribute__((target_clones("avx2", "default")))
#endif
void shiftInto(std::uint64_t* __restrict target, const unsigned char* __restrict source, std::size_t words,
               unsigned shift) {
    for (std::size_t i = 0; i < words; ++i) {
        std::uint64_t here = 0;
        std::uint64_t next = 0;
        std::memcpy(&here, source + 8 * i, 8);
        std::memcpy(&next, source + 8 * i + 1, 8);
        target[i] = here >> shift | next << (8 - shift);
    }
}

}  // namespace BitSets
