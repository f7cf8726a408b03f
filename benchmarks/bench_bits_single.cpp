// A bit each: appending, setting and testing in random order.

#include <cstring>
#include <random>
#include <vector>

#include "BitSets.h"
#include "Item.h"
#include "RLBitVec.h"

namespace {

using namespace BitSets;

// ---- Appending bit by bit.

template <class Vector>
void append(Vector& vector, bool bit);
template <>
void append(LRBitVec& vector, bool bit) {
    vector.addBit(bit);
}
template <>
void append(std::vector<bool>& vector, bool bit) {
    vector.push_back(bit);
}
template <>
void append(Boost& vector, bool bit) {
    vector.push_back(bit);
}

template <class Vector>
Vector appendAll() {
    Vector vector;
    for (std::size_t i = 0; i < smallBits; ++i) {
        append(vector, (first()[i >> 3] >> (i & 7) & 1) != 0);
    }
    return vector;
}

template <class Vector>
void appendBits(State& state) {
    agree(state, "append_bits", bytesOf(appendAll<Vector>()));
    measure(state, [] { benchmark::DoNotOptimize(appendAll<Vector>()); });
    state.SetItemsProcessed(state.iterations() * static_cast<std::int64_t>(smallBits));
}

Bytes shiftIntoWords() {
    Bytes bytes(smallBits / 8);
    for (std::size_t i = 0; i < smallBits; i += 64) {
        std::uint64_t word = 0;
        for (std::size_t bit = i; bit < i + 64; ++bit) {
            word = word >> 1 | static_cast<std::uint64_t>(first()[bit >> 3] >> (bit & 7) & 1) << 63;
        }
        std::memcpy(bytes.data() + i / 8, &word, sizeof word);
    }
    return bytes;
}

void appendLimit(State& state) {
    agree(state, "append_bits", shiftIntoWords());
    measure(state, [] { benchmark::DoNotOptimize(shiftIntoWords()); });
    state.SetItemsProcessed(state.iterations() * static_cast<std::int64_t>(smallBits));
}

const RegisterItem appendItem{{"append_bits",
                               {"LRBitVec", appendBits<LRBitVec>},
                               {{"vector<bool>", appendBits<std::vector<bool>>}, {"dynamic_bitset", appendBits<Boost>}},
                               {"shift into a word", appendLimit},
                               2.50,
                               10.00}};

/// Index values for random access to smallBits bits.
const std::vector<std::uint32_t>& places() {
    static const std::vector<std::uint32_t> list = [] {
        std::mt19937_64 random(3);
        std::vector<std::uint32_t> made(4096);
        for (std::uint32_t& place : made) {
            place = static_cast<std::uint32_t>(random() % smallBits);
        }
        return made;
    }();
    return list;
}

// ---- Single bits.

template <class Vector>
void setBit(Vector& vector, std::size_t place) {
    vector.set(static_cast<unsigned>(place));
}
void setBit(LRBitVec& vector, std::size_t place) {
    vector.setBit(place);
}
void setBit(Bytes& bytes, std::size_t place) {
    bytes[place >> 3] = static_cast<unsigned char>(bytes[place >> 3] | 1U << (place & 7));
}
template <class Vector>
bool testBit(const Vector& vector, std::size_t place) {
    return vector.test(static_cast<unsigned>(place));
}
bool testBit(const LRBitVec& vector, std::size_t place) {
    return vector.testBit(place);
}
bool testBit(const RLBitVec& vector, std::size_t place) {
    return vector.testBit(place);
}
bool testBit(const std::vector<bool>& vector, std::size_t place) {
    return vector[place];
}
bool testBit(const Bytes& bytes, std::size_t place) {
    return (bytes[place >> 3] >> (place & 7) & 1) != 0;
}
void setBit(std::vector<bool>& vector, std::size_t place) {
    vector[place] = true;
}

void countPlaces(State& state) {
    state.SetItemsProcessed(state.iterations() * static_cast<std::int64_t>(places().size()));
}

template <class Vector>
void setRandom(State& state) {
    Vector vector = make<Vector>(Bytes(smallBits / 8), smallBits);
    const auto setAll = [&] {
        for (const std::uint32_t place : places()) {
            setBit(vector, place);
        }
    };
    setAll();
    agree(state, "set_bit_random", bytesOf(vector));
    measure(state, setAll);
    countPlaces(state);
}

template <class Vector, bool mirrored>
void testRandom(State& state) {
    const Vector vector = make<Vector>(first(), smallBits);
    const auto sum = [&] {
        std::size_t ones = 0;
        for (const std::uint32_t place : places()) {
            // What has no mirrored index is asked for the bit where it lies.
            constexpr bool turn = mirrored && !std::is_same_v<Vector, RLBitVec>;
            ones += testBit(vector, turn ? smallBits - place - 1 : place) ? 1 : 0;
        }
        return ones;
    };
    const std::size_t ones = sum();
    agree(state, mirrored ? "mirrored_test_bit_random" : "test_bit_random",
          {static_cast<unsigned char>(ones), static_cast<unsigned char>(ones >> 8)});
    measure(state, [&] { benchmark::DoNotOptimize(sum()); });
    countPlaces(state);
}

template <class Vector>
void testStraight(State& state) {
    testRandom<Vector, false>(state);
}
template <class Vector>
void testMirrored(State& state) {
    testRandom<Vector, true>(state);
}

std::vector<Side> bitPeers(BenchmarkBody bools, BenchmarkBody boost, BenchmarkBody llvm) {
    std::vector<Side> peers = setPeers(boost, llvm);
    peers.push_back({"vector<bool>", bools});
    return peers;
}

const RegisterItem setItem{{"set_bit_random",
                            {"LRBitVec", setRandom<LRBitVec>},
                            bitPeers(setRandom<std::vector<bool>>, setRandom<Boost>, setRandom<Llvm>),
                            {"byte or", setRandom<Bytes>},
                            1.60,
                            1.15}};
const RegisterItem testItem{{"test_bit_random",
                             {"LRBitVec", testStraight<LRBitVec>},
                             bitPeers(testStraight<std::vector<bool>>, testStraight<Boost>, testStraight<Llvm>),
                             {"byte and", testStraight<Bytes>},
                             1.30,
                             1.15}};
const RegisterItem mirroredItem{{"mirrored_test_bit_random",
                                 {"RLBitVec", testMirrored<RLBitVec>},
                                 bitPeers(testMirrored<std::vector<bool>>, testMirrored<Boost>, testMirrored<Llvm>),
                                 {"byte and", testMirrored<Bytes>},
                                 1.35,
                                 1.35}};

}  // namespace
