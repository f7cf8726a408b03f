// Runs a test with the wide forms of the kernels, where the processor has them, or with the narrow ones.
#pragma once

#include "s/WideVectors.h"

class VectorWidth {
public:
    explicit VectorWidth(bool wide) { wideVectors = wideVectors && wide; }
    ~VectorWidth() { wideVectors = m_former; }
    VectorWidth(const VectorWidth&) = delete;
    VectorWidth& operator=(const VectorWidth&) = delete;

private:
    const bool m_former = wideVectors;
};
