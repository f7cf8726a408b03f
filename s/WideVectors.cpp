#include "s/WideVectors.h"

namespace {

bool processorHasWideVectors() {
#if TESSAL_HAS_WIDE
    return __builtin_cpu_supports("avx2") != 0 && __builtin_cpu_supports("popcnt") != 0;
#else
    return false;
#endif
}

bool processorHasBytePermutations() {
#if TESSAL_HAS_WIDE
    return __builtin_cpu_supports("avx512f") != 0 && __builtin_cpu_supports("avx512bw") != 0 &&
           __builtin_cpu_supports("avx512vbmi") != 0;
#else
    return false;
#endif
}

}  // namespace

// Until it is set, while statics of other units are made, the narrow form serves.
bool wideVectors = processorHasWideVectors();
bool bytePermutations = processorHasBytePermutations();
