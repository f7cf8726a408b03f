// 32-byte vectors, and permutations of the bytes of two 64-byte ones, behind a check at run time.
//
// The body of a kernel is written once, as a TESSAL_INLINE_BODY template on the block it works with. It is compiled
// twice: for NarrowBlock into a plain function, and for WideBlock into one marked TESSAL_WIDE. The kernel picks one by
// hasWideVectors().
//
// Where the build says TESSAL_NO_WIDE_VECTORS it is narrow blocks throughout: g++ for Windows keeps 32-byte values safe
// on the stack only with the help of its assembler (see cmake/Settings.cmake).
#pragma once

#include <cstddef>
#include <cstdint>
#include <cstring>

#if defined(__GNUC__) && defined(__x86_64__) && !defined(TESSAL_NO_WIDE_VECTORS)
#define TESSAL_HAS_WIDE 1
#define TESSAL_WIDE __attribute__((target("avx2,popcnt")))
#define TESSAL_PERMUTING __attribute__((target("avx2,avx512f,avx512bw,avx512vbmi")))
#include <immintrin.h>
#else
#define TESSAL_HAS_WIDE 0
#define TESSAL_WIDE
#endif

#define TESSAL_INLINE_BODY inline __attribute__((always_inline))

/// Words that are worked on side by side.
using NarrowBlock = std::uint64_t __attribute__((vector_size(16)));
#if TESSAL_HAS_WIDE
using WideBlock = std::uint64_t __attribute__((vector_size(32)));
#else
using WideBlock = NarrowBlock;
#endif

/// Whether the processor has what functions marked TESSAL_WIDE need. Tests clear it to run the narrow form.
extern bool wideVectors;

inline bool hasWideVectors() {
    return wideVectors;
}

/// The same for what functions marked TESSAL_PERMUTING need beside wide vectors.
extern bool bytePermutations;

inline bool hasBytePermutations() {
    return wideVectors && bytePermutations;
}

template <class Block>
TESSAL_INLINE_BODY void loadBlock(Block& block, const void* bytes) {
    std::memcpy(&block, bytes, sizeof block);
}

template <class Block>
TESSAL_INLINE_BODY void storeBlock(void* bytes, const Block& block) {
    std::memcpy(bytes, &block, sizeof block);
}

/// The bits that any word of the block has.
template <class Block>
TESSAL_INLINE_BODY std::uint64_t anyBits(const Block& block) {
    std::uint64_t bits = 0;
    for (std::size_t i = 0; i < sizeof(Block) / sizeof(std::uint64_t); ++i) {
        bits |= block[i];
    }
    return bits;
}
