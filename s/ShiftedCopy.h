// Copies of whole target bytes from any bit of a source.
#pragma once

#include <cstddef>

namespace BitKernels {

/// Copies bytes that begin at bit @p sourceFirst of the source. The target may overlap the source where it begins below
/// it.
void copyBytesFromLowEnd(unsigned char* target, const unsigned char* source, std::size_t sourceFirst,
                         std::size_t count);
/// The same for a target that may overlap the source where it begins above it.
void copyBytesFromHighEnd(unsigned char* target, const unsigned char* source, std::size_t sourceFirst,
                          std::size_t count);

}  // namespace BitKernels
