// 32-byte vectors behind a check at run time.
//
// A kernel's body is written once, on Block values, as a TESSAL_INLINE_BODY function. It is compiled twice: into a
// plain function, where the compiler splits each block into what the build's processor has, and into one marked
// TESSAL_WIDE. The public function picks one by hasWideVectors().
//
// Where the build says TESSAL_NO_WIDE_VECTORS, both are the plain one: g++ for Windows keeps 32-byte values safe on the
// stack only with the help of its assembler (see cmake/Settings.cmake).
#pragma once

#include <cstdint>
#include <cstring>

#if defined(__GNUC__) && defined(__x86_64__) && !defined(TESSAL_NO_WIDE_VECTORS)
#define TESSAL_WIDE __attribute__((target("avx2")))
#define TESSAL_HAS_WIDE 1
#else
#define TESSAL_WIDE
#define TESSAL_HAS_WIDE 0
#endif

#define TESSAL_INLINE_BODY inline __attribute__((always_inline))

/// Four words that are worked on side by side.
using Block = std::uint64_t __attribute__((vector_size(32)));
constexpr std::size_t blockBytes = sizeof(Block);

/// True when the processor has what functions marked TESSAL_WIDE need.
inline bool hasWideVectors() {
#if TESSAL_HAS_WIDE
    return __builtin_cpu_supports("avx2") != 0;
#else
    return false;
#endif
}
