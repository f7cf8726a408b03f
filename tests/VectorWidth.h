// Runs a test with the wide forms of the kernels, where the processor has them, or with the narrow ones.
#pragma once

#include "s/WideVectors.h"

class VectorWidth {
public:
    explicit VectorWidth(bool wide, bool permutations = true) {
        wideVectors = wideVectors && wide;
        bytePermutations = bytePermutations && permutations;
    }
    ~VectorWidth() {
        wideVectors = m_formerWide;
        bytePermutations = m_formerPermutations;
    }
    VectorWidth(const VectorWidth&) = delete;
    VectorWidth& operator=(const VectorWidth&) = delete;

private:
    const bool m_formerWide = wideVectors;
    const bool m_formerPermutations = bytePermutations;
};
