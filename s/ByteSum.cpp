#include "s/ByteSum.h"

#include <numeric>

#include "s/BitKernels.h"
#include "s/WideVectors.h"

#if defined(__x86_64__)
#include <immintrin.h>
#endif

namespace {

using BitKernels::loadWord;
using BitKernels::Word;

std::uint64_t sumSingly(const unsigned char* bytes, std::size_t count) {
    return std::accumulate(bytes, bytes + count, std::uint64_t{0});
}

/// The sum of the word's eight bytes.
std::uint64_t sumOfWord(Word word) {
    constexpr Word evenBytes = 0x00FF00FF00FF00FF;
    constexpr Word addAll = 0x0001000100010001;
    const Word pairs = (word & evenBytes) + ((word >> 8) & evenBytes);
    return (pairs * addAll) >> 48;
}

#if defined(__x86_64__)

// The processor adds up the differences of eight bytes each to eight zeros in one instruction. Four sums are kept, so
// that no addition waits for the one before.

std::uint64_t sumBlocks16(const unsigned char* bytes, std::size_t count) {
    const __m128i zero = _mm_setzero_si128();
    __m128i sums[4] = {zero, zero, zero, zero};
    for (std::size_t i = 0; i < count; i += 64) {
        for (std::size_t k = 0; k < 4; ++k) {
            const __m128i block = _mm_loadu_si128(reinterpret_cast<const __m128i*>(bytes + i + 16 * k));
            sums[k] = _mm_add_epi64(sums[k], _mm_sad_epu8(block, zero));
        }
    }
    const __m128i sum = _mm_add_epi64(_mm_add_epi64(sums[0], sums[1]), _mm_add_epi64(sums[2], sums[3]));
    std::uint64_t halves[2];
    _mm_storeu_si128(reinterpret_cast<__m128i*>(halves), sum);
    return halves[0] + halves[1];
}

#if TESSAL_HAS_WIDE
TESSAL_WIDE std::uint64_t sumBlocks32(const unsigned char* bytes, std::size_t count) {
    const __m256i zero = _mm256_setzero_si256();
    __m256i sums[4] = {zero, zero, zero, zero};
    for (std::size_t i = 0; i < count; i += 128) {
        for (std::size_t k = 0; k < 4; ++k) {
            const __m256i block = _mm256_loadu_si256(reinterpret_cast<const __m256i*>(bytes + i + 32 * k));
            sums[k] = _mm256_add_epi64(sums[k], _mm256_sad_epu8(block, zero));
        }
    }
    const __m256i sum = _mm256_add_epi64(_mm256_add_epi64(sums[0], sums[1]), _mm256_add_epi64(sums[2], sums[3]));
    std::uint64_t quarters[4];
    _mm256_storeu_si256(reinterpret_cast<__m256i*>(quarters), sum);
    return quarters[0] + quarters[1] + quarters[2] + quarters[3];
}
#endif

#endif

}  // namespace

std::uint64_t sumBytesPortably(const unsigned char* bytes, std::size_t count) {
    const std::size_t inWords = count - count % sizeof(Word);
    std::uint64_t sum = 0;
    for (std::size_t i = 0; i < inWords; i += sizeof(Word)) {
        sum += sumOfWord(loadWord(bytes + i));
    }
    return sum + sumSingly(bytes + inWords, count - inWords);
}

std::uint64_t sumBytes(const unsigned char* bytes, std::size_t count) {
#if defined(__x86_64__)
    std::size_t summed = 0;
    std::uint64_t sum = 0;
#if TESSAL_HAS_WIDE
    if (hasWideVectors()) {
        summed = count - count % 128;
        sum = sumBlocks32(bytes, summed);
    }
#endif
    const std::size_t inBlocks = (count - summed) - (count - summed) % 64;
    sum += sumBlocks16(bytes + summed, inBlocks);
    summed += inBlocks;
    return sum + sumBytesPortably(bytes + summed, count - summed);
#else
    return sumBytesPortably(bytes, count);
#endif
}
