// The fastest shifted copy of the machine by a plain loop, into memory that is there: what joining is held against.
#pragma once

#include "BitSets.h"

namespace BitSets {

void shiftInto(std::uint64_t* target, const unsigned char* source, std::size_t words, unsigned shift);

template <std::size_t bits>
void shiftedCopyLimit(State& state) {
    std::vector<std::uint64_t> target(bits / 64);
    measure(state, [&] {
        shiftInto(target.data(), second().data(), target.size() - 1, 5);
        benchmark::DoNotOptimize(target.data());
    });
}

}  // namespace BitSets
