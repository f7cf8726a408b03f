// Inputs for benchmarks of texts and bytes, made once, and what their sides share.
//
// The peers decode or encode in their own order, which is one of those that ours has; every side's result is compared
// before its clock starts.
#pragma once

#include <cstring>
#include <memory>
#include <string>
#include <vector>

#include "Item.h"

namespace HexTexts {

using State = benchmark::State;
using Bytes = std::vector<unsigned char>;

constexpr std::size_t characterCount = std::size_t{1} << 20;

/// Bytes of no pattern: as many as there are characters, as they have digits, and as they have bits.
const Bytes& bytes();
const Bytes& digitBytes();
const Bytes& bitBytes();

/// Hex text of digitBytes(), digit by digit.
const std::string& hexText();

/// Binary text of bitBytes(), from the first byte's lowest bit up.
const std::string& binaryText();

/// Throws when a side gives a wrong result.
void check(bool equal);

Bytes reordered(Bytes bytes, bool lastFirst, bool mirrorBits);
std::string lowerCase(std::string text);

/// Times the work. It runs twice before the clock starts, so that memory which it takes and gives back is the process's
/// already: page faults of the first calls would be most of what few iterations show.
template <class Work>
void measure(State& state, Work work) {
    work();
    work();
    for (auto _ : state) {
        work();
        benchmark::ClobberMemory();
    }
}

template <class Unit>
void copyOf(State& state, const Unit* source, std::size_t count) {
    std::vector<Unit> target(count);
    measure(state, [&] {
        benchmark::DoNotOptimize(source);
        std::memcpy(target.data(), source, count);
        benchmark::DoNotOptimize(target.data());
    });
}

template <class Unit>
void newCopyOf(State& state, const Unit* source, std::size_t count) {
    measure(state, [&] {
        const std::unique_ptr<Unit[]> target(new Unit[count]);
        std::memcpy(target.get(), source, count);
        benchmark::DoNotOptimize(target.get());
    });
}

void newCopyOfText(State& state);

}  // namespace HexTexts
