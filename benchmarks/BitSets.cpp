#include "BitSets.h"

#include <cstring>
#include <map>
#include <random>
#include <string>

namespace BitSets {
Bytes randomBytes(std::size_t size, unsigned seed) {
    std::mt19937_64 random(seed);
    Bytes bytes(size);
    for (unsigned char& byte : bytes) {
        byte = static_cast<unsigned char>(random());
    }
    return bytes;
}

const Bytes& first() {
    static const Bytes bytes = randomBytes(bulkBits / 8, 1);
    return bytes;
}

const Bytes& second() {
    static const Bytes bytes = randomBytes(bulkBits / 8, 2);
    return bytes;
}

template <>
Bytes make<Bytes>(const Bytes& bytes, std::size_t bits) {
    return Bytes(bytes.begin(), bytes.begin() + static_cast<std::ptrdiff_t>((bits + 7) / 8));
}

template <>
std::vector<bool> make<std::vector<bool>>(const Bytes& bytes, std::size_t bits) {
    std::vector<bool> made(bits);
    for (std::size_t i = 0; i < bits; ++i) {
        made[i] = (bytes[i / 8] >> (i % 8) & 1) != 0;
    }
    return made;
}

template <>
Boost make<Boost>(const Bytes& bytes, std::size_t bits) {
    std::vector<std::uint64_t> words((bits + 63) / 64);
    std::memcpy(words.data(), bytes.data(), (bits + 7) / 8);
    Boost set(words.begin(), words.end());
    set.resize(bits);
    return set;
}

Bytes bytesOf(const LRBitVec& vector) {
    return Bytes(vector.data(), vector.data() + vector.getNumberBytes());
}

Bytes bytesOf(const Boost& set) {
    std::vector<std::uint64_t> words(set.num_blocks());
    boost::to_block_range(set, words.begin());
    Bytes bytes((set.size() + 7) / 8);
    std::memcpy(bytes.data(), words.data(), bytes.size());
    return bytes;
}

namespace {

template <class Set>
Bytes bytesByBit(const Set& set, std::size_t bits) {
    Bytes bytes((bits + 7) / 8);
    for (std::size_t i = 0; i < bits; ++i) {
        bytes[i / 8] = static_cast<unsigned char>(bytes[i / 8] | (set[static_cast<unsigned>(i)] ? 1U : 0U) << (i % 8));
    }
    return bytes;
}

}  // namespace

Bytes bytesOf(const std::vector<bool>& set) {
    return bytesByBit(set, set.size());
}

Bytes bytesOf(const Bytes& bytes) {
    return bytes;
}

#ifdef TESSAL_HAS_LLVM
template <>
Llvm make<Llvm>(const Bytes& bytes, std::size_t bits) {
    Llvm set(static_cast<unsigned>(bits));
    for (std::size_t i = 0; i < bits; ++i) {
        set[static_cast<unsigned>(i)] = (bytes[i / 8] >> (i % 8) & 1) != 0;
    }
    return set;
}

Bytes bytesOf(const Llvm& set) {
    return bytesByBit(set, set.size());
}
#endif

std::vector<Side> setPeers(BenchmarkBody boost, [[maybe_unused]] BenchmarkBody llvm) {
    std::vector<Side> peers{{"dynamic_bitset", boost}};
#ifdef TESSAL_HAS_LLVM
    peers.push_back({"llvm BitVector", llvm});
#endif
    return peers;
}

void agree(State& state, const char* item, const Bytes& result) {
    static std::map<std::string, Bytes> results;
    const auto [found, isNew] = results.emplace(item, result);
    if (!isNew && found->second != result) {
        state.SkipWithError("the sides disagree");
    }
}

}  // namespace BitSets
