// Inputs for benchmarks of bits, and the same bits in each kind of vector.
//
// Every side hands in its result once before its clock starts, and must agree with the others.
#pragma once

#include <boost/dynamic_bitset.hpp>
#include <cstdint>
#include <vector>
#if __has_include(<llvm/ADT/BitVector.h>)
#include <llvm/ADT/BitVector.h>
#define TESSAL_HAS_LLVM
#endif

#include "Item.h"
#include "LRBitVec.h"

namespace BitSets {

using Bytes = std::vector<unsigned char>;
using Boost = boost::dynamic_bitset<std::uint64_t>;
using State = benchmark::State;

constexpr std::size_t bulkBits = std::size_t{8} << 20;
constexpr std::size_t joinedBits = std::size_t{1} << 20;
constexpr std::size_t smallBits = std::size_t{1} << 16;

Bytes randomBytes(std::size_t size, unsigned seed);

/// Two inputs of bulkBits, made once.
const Bytes& first();
const Bytes& second();

template <class Vector>
Vector make(const Bytes& bytes, std::size_t bits) {
    return Vector(bytes.data(), bits);
}
template <>
Bytes make<Bytes>(const Bytes& bytes, std::size_t bits);
template <>
std::vector<bool> make<std::vector<bool>>(const Bytes& bytes, std::size_t bits);
template <>
Boost make<Boost>(const Bytes& bytes, std::size_t bits);

Bytes bytesOf(const LRBitVec& vector);
Bytes bytesOf(const Boost& set);
Bytes bytesOf(const std::vector<bool>& set);
Bytes bytesOf(const Bytes& bytes);

#ifdef TESSAL_HAS_LLVM
using Llvm = llvm::BitVector;

template <>
Llvm make<Llvm>(const Bytes& bytes, std::size_t bits);

Bytes bytesOf(const Llvm& set);
#else
/// In the place of what is not there; setPeers() leaves it out.
using Llvm = Boost;
#endif

std::vector<Side> setPeers(BenchmarkBody boost, BenchmarkBody llvm);

/// The first side to hand in a result sets what the others must equal.
void agree(State& state, const char* item, const Bytes& result);

template <class Work>
void measure(State& state, Work work) {
    for (auto _ : state) {
        work();
        benchmark::ClobberMemory();
    }
}

}  // namespace BitSets
