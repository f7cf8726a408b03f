// Bit vectors against other bit sets and against plain loops over the same bytes.
//
// Bulk rows work on 8 Mi bits, hex rows on 1 Mi digits, joining and register rows on 1 Mi bits; appending and random
// access are a bit each. Every side hands in its result once before its clock starts, and must agree with the others.

#include <boost/dynamic_bitset.hpp>
#include <cstring>
#include <map>
#include <memory>
#include <random>
#include <string>
#include <vector>
#if __has_include(<llvm/ADT/BitVector.h>)
#include <llvm/ADT/BitVector.h>
#define TESSAL_HAS_LLVM
#endif
#ifdef TESSAL_HAS_SODIUM
#include <sodium.h>
#endif

#include "Item.h"
#include "RLBitVec.h"
#include "Register.h"

namespace {

using Bytes = std::vector<unsigned char>;
using Boost = boost::dynamic_bitset<std::uint64_t>;
using State = benchmark::State;

constexpr std::size_t bulkBits = std::size_t{8} << 20;
constexpr std::size_t joinedBits = std::size_t{1} << 20;
constexpr std::size_t fieldStart = 13;
constexpr std::size_t digitCount = std::size_t{1} << 20;
constexpr std::size_t smallBits = std::size_t{1} << 16;

// ---- Inputs, made once.

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

const std::string& hexText() {
    static const std::string text = [] {
        std::string made;
        for (const unsigned char byte : randomBytes(digitCount / 2, 4)) {
            made += "0123456789abcdef"[byte >> 4];
            made += "0123456789abcdef"[byte & 15];
        }
        return made;
    }();
    return text;
}

// ---- The same content in each kind of vector, and back.

template <class Vector>
Vector make(const Bytes& bytes, std::size_t bits) {
    return Vector(bytes.data(), bits);
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

template <class Set>
Bytes bytesByBit(const Set& set, std::size_t bits) {
    Bytes bytes((bits + 7) / 8);
    for (std::size_t i = 0; i < bits; ++i) {
        bytes[i / 8] = static_cast<unsigned char>(bytes[i / 8] | (set[static_cast<unsigned>(i)] ? 1U : 0U) << (i % 8));
    }
    return bytes;
}

Bytes bytesOf(const std::vector<bool>& set) {
    return bytesByBit(set, set.size());
}

Bytes bytesOf(const Bytes& bytes) {
    return bytes;
}

#ifdef TESSAL_HAS_LLVM
using Llvm = llvm::BitVector;

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

template <>
Bytes make<Bytes>(const Bytes& bytes, std::size_t bits) {
    return Bytes(bytes.begin(), bytes.begin() + static_cast<std::ptrdiff_t>((bits + 7) / 8));
}

/// The first side to hand in a result sets what the others must equal.
void agree(State& state, const char* item, const Bytes& result) {
    static std::map<std::string, Bytes> results;
    const auto [found, isNew] = results.emplace(item, result);
    if (!isNew && found->second != result) {
        state.SkipWithError("the sides disagree");
    }
}

template <class Work>
void measure(State& state, Work work) {
    for (auto _ : state) {
        work();
        benchmark::ClobberMemory();
    }
}

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

// ---- Whole vectors: each operation is a type with a name and one function for each kind of vector.

struct And {
    static constexpr const char* name = "and_assign";
    template <class Vector>
    static void run(Vector& a, const Vector& b) {
        a &= b;
    }
    static void run(Bytes& a, const Bytes& b) {
        words(a, b, [](std::uint64_t& x, std::uint64_t y) { x &= y; });
    }

    template <class Step>
    static void words(Bytes& a, const Bytes& b, Step step) {
        for (std::size_t i = 0; i < a.size(); i += 8) {
            std::uint64_t x = 0;
            std::uint64_t y = 0;
            std::memcpy(&x, a.data() + i, 8);
            std::memcpy(&y, b.data() + i, 8);
            step(x, y);
            std::memcpy(a.data() + i, &x, 8);
        }
    }
};

struct Xor {
    static constexpr const char* name = "xor_assign";
    template <class Vector>
    static void run(Vector& a, const Vector& b) {
        a ^= b;
    }
    static void run(Bytes& a, const Bytes& b) {
        And::words(a, b, [](std::uint64_t& x, std::uint64_t y) { x ^= y; });
    }
};

struct NotInPlace {
    static constexpr const char* name = "not_in_place";
    static void run(LRBitVec& a, const LRBitVec&) { !a; }
    static void run(Boost& a, const Boost&) { a.flip(); }
    static void run(Bytes& a, const Bytes&) {
        And::words(a, a, [](std::uint64_t& x, std::uint64_t) { x = ~x; });
    }
#ifdef TESSAL_HAS_LLVM
    static void run(Llvm& a, const Llvm&) {
        a.flip();
    }
#endif
};

template <std::size_t distance, bool up>
struct Shift {
    static constexpr const char* name =
        distance == 1 ? (up ? "shift_up_1" : "shift_down_1") : (up ? "shift_up_13" : "shift_down_13");
    static void run(LRBitVec& a, const LRBitVec&) { up ? a >> distance : a << distance; }
    static void run(Boost& a, const Boost&) { up ? a <<= distance : a >>= distance; }
#ifdef TESSAL_HAS_LLVM
    static void run(Llvm& a, const Llvm&) {
        up ? a <<= distance : a >>= distance;
    }
#endif
};

template <class Operation, class Vector>
void inPlace(State& state) {
    Vector a = make<Vector>(first(), bulkBits);
    const Vector b = make<Vector>(second(), bulkBits);
    Operation::run(a, b);
    agree(state, Operation::name, bytesOf(a));
    measure(state, [&] { Operation::run(a, b); });
}

void copyLimit(State& state) {
    Bytes target(bulkBits / 8);
    measure(state, [&] {
        std::memcpy(target.data(), first().data(), target.size());
        benchmark::DoNotOptimize(target.data());
    });
}

std::vector<Side> bulkPeers(BenchmarkBody boost, [[maybe_unused]] BenchmarkBody llvm) {
    std::vector<Side> peers{{"dynamic_bitset", boost}};
#ifdef TESSAL_HAS_LLVM
    peers.push_back({"llvm BitVector", llvm});
#endif
    return peers;
}

template <class Operation>
std::vector<Side> inPlacePeers() {
#ifdef TESSAL_HAS_LLVM
    return bulkPeers(inPlace<Operation, Boost>, inPlace<Operation, Llvm>);
#else
    return bulkPeers(inPlace<Operation, Boost>, nullptr);
#endif
}

template <class Operation>
Item inPlaceItem(Side limit, double peerGoal, double limitGoal) {
    return {Operation::name, {"LRBitVec", inPlace<Operation, LRBitVec>}, inPlacePeers<Operation>(), limit, peerGoal,
            limitGoal};
}

const RegisterItem andItem{inPlaceItem<And>({"word loop", inPlace<And, Bytes>}, 1.10, 1.20)};
const RegisterItem xorItem{inPlaceItem<Xor>({"word loop", inPlace<Xor, Bytes>}, 1.10, 1.20)};
const RegisterItem notInPlaceItem{inPlaceItem<NotInPlace>({"word loop", inPlace<NotInPlace, Bytes>}, 1.05, 1.50)};
const RegisterItem shiftItems[]{RegisterItem(inPlaceItem<Shift<1, true>>({"memcpy", copyLimit}, 0.65, 1.30)),
                                RegisterItem(inPlaceItem<Shift<13, true>>({"memcpy", copyLimit}, 0.65, 1.30)),
                                RegisterItem(inPlaceItem<Shift<1, false>>({"memcpy", copyLimit}, 0.85, 1.30)),
                                RegisterItem(inPlaceItem<Shift<13, false>>({"memcpy", copyLimit}, 0.85, 1.30))};

// ---- New vectors and results that are no vector.

LRBitVec complement(const LRBitVec& a) {
    return !a;
}
Boost complement(const Boost& a) {
    return ~a;
}
std::size_t lowest(const LRBitVec& a) {
    return a.firstTrue();
}
std::size_t lowest(const Boost& a) {
    return a.find_first();
}
#ifdef TESSAL_HAS_LLVM
Llvm complement(const Llvm& a) {
    return Llvm(a).flip();
}
std::size_t lowest(const Llvm& a) {
    return static_cast<std::size_t>(a.find_first());
}
#endif

template <class Vector>
void notNew(State& state) {
    const Vector a = make<Vector>(first(), bulkBits);
    agree(state, "not_new_vector", bytesOf(complement(a)));
    measure(state, [&] { benchmark::DoNotOptimize(complement(a)); });
}

void newCopyLimit(State& state) {
    measure(state, [] {
        const std::unique_ptr<unsigned char[]> copy(new unsigned char[bulkBits / 8]);
        std::memcpy(copy.get(), first().data(), bulkBits / 8);
        benchmark::DoNotOptimize(copy.get());
    });
}

template <class Vector>
void compareEqual(State& state) {
    const Vector a = make<Vector>(first(), bulkBits);
    const Vector b = make<Vector>(first(), bulkBits);
    agree(state, "compare_equal", {static_cast<unsigned char>(a == b)});
    measure(state, [&] { benchmark::DoNotOptimize(a == b); });
}

void compareLimit(State& state) {
    const Bytes a(first());  // NOLINT(performance-unnecessary-copy-initialization): two arrays are compared
    measure(state, [&] {
        benchmark::DoNotOptimize(a.data());
        benchmark::DoNotOptimize(std::memcmp(a.data(), first().data(), a.size()));
    });
}

/// All zeros but for the last bit but two.
const Bytes& sparse() {
    static const Bytes bytes = [] {
        Bytes made(bulkBits / 8);
        made.back() = 0x20;
        return made;
    }();
    return bytes;
}

template <class Vector>
void firstTrue(State& state) {
    const Vector a = make<Vector>(sparse(), bulkBits);
    if (lowest(a) != bulkBits - 3) {
        state.SkipWithError("not found");
    }
    measure(state, [&] { benchmark::DoNotOptimize(lowest(a)); });
}

void firstTrueLimit(State& state) {
    const std::size_t words = bulkBits / 64;
    std::vector<std::uint64_t> a(words);
    std::memcpy(a.data(), sparse().data(), bulkBits / 8);
    measure(state, [&] {
        std::size_t i = 0;
        for (; i + 8 <= words; i += 8) {
            const std::uint64_t* const w = a.data() + i;
            if ((w[0] | w[1] | w[2] | w[3] | w[4] | w[5] | w[6] | w[7]) != 0) {
                break;
            }
        }
        benchmark::DoNotOptimize(i);
    });
}

#ifdef TESSAL_HAS_LLVM
#define TESSAL_LLVM_BODY(function) function<Llvm>
#else
#define TESSAL_LLVM_BODY(function) nullptr
#endif

const RegisterItem notNewItem{{"not_new_vector",
                               {"LRBitVec", notNew<LRBitVec>},
                               bulkPeers(notNew<Boost>, TESSAL_LLVM_BODY(notNew)),
                               {"new, memcpy", newCopyLimit},
                               0.80,
                               1.30}};
const RegisterItem compareItem{{"compare_equal",
                                {"LRBitVec", compareEqual<LRBitVec>},
                                bulkPeers(compareEqual<Boost>, TESSAL_LLVM_BODY(compareEqual)),
                                {"memcmp", compareLimit},
                                1.10,
                                1.20}};
const RegisterItem firstTrueItem{{"first_true",
                                  {"LRBitVec", firstTrue<LRBitVec>},
                                  bulkPeers(firstTrue<Boost>, TESSAL_LLVM_BODY(firstTrue)),
                                  {"word scan", firstTrueLimit},
                                  1.05,
                                  1.30}};

// ---- Joining. The left part's length is no multiple of 8, so the right part is shifted.

constexpr std::size_t leftBits = bulkBits / 2 + 3;
constexpr std::size_t rightBits = bulkBits / 2 - 64;

/// Bits behind bits in new memory, as a loop over words.
Bytes shiftedCopy(const Bytes& low, std::size_t lowBits, const Bytes& high, std::size_t highBits) {
    Bytes result((lowBits + highBits + 7) / 8 + 8);
    std::memcpy(result.data(), low.data(), (lowBits + 7) / 8);
    const unsigned shift = lowBits % 8;
    unsigned char* const target = result.data() + lowBits / 8;
    target[0] = static_cast<unsigned char>((target[0] & ((1U << shift) - 1)) | unsigned{high[0]} << shift);
    for (std::size_t i = 1; i < (highBits + 7 + shift) / 8; ++i) {
        const unsigned upper = i < high.size() ? high[i] : 0;
        target[i] = static_cast<unsigned char>(high[i - 1] >> (8 - shift) | upper << shift);
    }
    result.resize((lowBits + highBits + 7) / 8);
    if ((lowBits + highBits) % 8 != 0) {
        result.back() = static_cast<unsigned char>(result.back() & ((1U << (lowBits + highBits) % 8) - 1));
    }
    return result;
}

/// The fastest shifted copy of the machine, into memory that is there: what joining cannot be below.
#if defined(__x86_64__) && defined(__GNUC__)
__attribute__((target_clones("avx2", "default")))
#endif
void shiftInto(std::uint64_t* __restrict target, const unsigned char* __restrict source, std::size_t words,
               unsigned shift) {
    for (std::size_t i = 0; i < words; ++i) {
        std::uint64_t here = 0;
        std::uint64_t next = 0;
        std::memcpy(&here, source + 8 * i, 8);
        std::memcpy(&next, source + 8 * i + 1, 8);
        target[i] = here >> shift | next << (8 - shift);
    }
}

template <std::size_t bits>
void shiftedCopyLimit(State& state) {
    std::vector<std::uint64_t> target(bits / 64);
    measure(state, [&] {
        shiftInto(target.data(), second().data(), target.size() - 1, 5);
        benchmark::DoNotOptimize(target.data());
    });
}

void concatenateOurs(State& state) {
    const LRBitVec left = make<LRBitVec>(first(), leftBits);
    const LRBitVec right = make<LRBitVec>(second(), rightBits);
    LRBitVec joined(left);
    joined += right;
    agree(state, "concatenate", bytesOf(joined));
    measure(state, [&] {
        joined.setNumberBits(leftBits);
        joined += right;
    });
}

void concatenateBoost(State& state) {
    const Boost left = make<Boost>(first(), leftBits);
    const Boost right = make<Boost>(second(), rightBits);
    const auto join = [&](Boost& joined) {
        joined.resize(leftBits + rightBits);
        Boost moved(right);
        moved.resize(leftBits + rightBits);
        moved <<= leftBits;
        joined |= moved;
    };
    Boost joined(left);
    join(joined);
    agree(state, "concatenate", bytesOf(joined));
    measure(state, [&] {
        joined.resize(leftBits);
        join(joined);
    });
}

const RegisterItem concatenateItem{{"concatenate",
                                    {"LRBitVec", concatenateOurs},
                                    {{"dynamic_bitset", concatenateBoost}},
                                    {"shifted copy", shiftedCopyLimit<rightBits>},
                                    0.35,
                                    1.40}};

constexpr std::size_t plusLeft = joinedBits / 2;
constexpr std::size_t plusRight = joinedBits / 2 + 5;

void plusOurs(State& state) {
    const auto left = make<RLBitVec>(first(), plusLeft);
    const auto right = make<RLBitVec>(second(), plusRight);
    const auto join = [&] { return std::unique_ptr<RLBitVec>(&(left + right)); };
    agree(state, "mirrored_plus", bytesOf(*join()));
    measure(state, [&] { benchmark::DoNotOptimize(join()); });
}

void plusBoost(State& state) {
    const Boost left = make<Boost>(first(), plusLeft);
    const Boost right = make<Boost>(second(), plusRight);
    const auto join = [&] {
        Boost result(left);
        result.resize(plusLeft + plusRight);
        result <<= plusRight;
        Boost low(right);
        low.resize(plusLeft + plusRight);
        result |= low;
        return result;
    };
    agree(state, "mirrored_plus", bytesOf(join()));
    measure(state, [&] { benchmark::DoNotOptimize(join()); });
}

void plusLimit(State& state) {
    agree(state, "mirrored_plus", shiftedCopy(second(), plusRight, first(), plusLeft));
    measure(state, [&] {
        const std::unique_ptr<unsigned char[]> result(new unsigned char[joinedBits / 8 + 16]);
        std::memcpy(result.get(), second().data(), plusRight / 8);
        shiftInto(reinterpret_cast<std::uint64_t*>(result.get() + plusRight / 8 / 8 * 8), first().data(), plusLeft / 64,
                  3);
        benchmark::DoNotOptimize(result.get());
    });
}

const RegisterItem plusItem{{"mirrored_plus",
                             {"RLBitVec", plusOurs},
                             {{"dynamic_bitset", plusBoost}},
                             {"new, memcpy, shifted copy", plusLimit},
                             0.40,
                             1.40}};

constexpr std::size_t fieldBits = joinedBits - 64;

void fieldOurs(State& state) {
    auto target = make<RLBitVec>(first(), joinedBits);
    const auto field = make<RLBitVec>(second(), fieldBits);
    const auto update = [&] { target.updateBitField(&field, static_cast<int>(fieldStart), true); };
    update();
    agree(state, "update_field", bytesOf(target));
    measure(state, update);
}

void fieldBoost(State& state) {
    Boost target = make<Boost>(first(), joinedBits);
    const Boost field = make<Boost>(second(), fieldBits);
    Boost mask(joinedBits);
    mask.set(fieldStart, fieldBits, true);
    const auto update = [&] {
        Boost moved(field);
        moved.resize(joinedBits);
        moved <<= fieldStart;
        target -= mask;
        target |= moved;
    };
    update();
    agree(state, "update_field", bytesOf(target));
    measure(state, update);
}

const RegisterItem fieldItem{{"update_field",
                              {"RLBitVec", fieldOurs},
                              {{"dynamic_bitset", fieldBoost}},
                              {"shifted copy", shiftedCopyLimit<fieldBits>},
                              0.15,
                              1.40}};

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

template <>
std::vector<bool> make<std::vector<bool>>(const Bytes& bytes, std::size_t bits) {
    std::vector<bool> made(bits);
    for (std::size_t i = 0; i < bits; ++i) {
        made[i] = testBit(bytes, i);
    }
    return made;
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
    std::vector<Side> peers = bulkPeers(boost, llvm);
    peers.push_back({"vector<bool>", bools});
    return peers;
}

const RegisterItem setItem{{"set_bit_random",
                            {"LRBitVec", setRandom<LRBitVec>},
                            bitPeers(setRandom<std::vector<bool>>, setRandom<Boost>, TESSAL_LLVM_BODY(setRandom)),
                            {"byte or", setRandom<Bytes>},
                            1.60,
                            1.15}};
const RegisterItem testItem{
    {"test_bit_random",
     {"LRBitVec", testStraight<LRBitVec>},
     bitPeers(testStraight<std::vector<bool>>, testStraight<Boost>, TESSAL_LLVM_BODY(testStraight)),
     {"byte and", testStraight<Bytes>},
     1.30,
     1.15}};
const RegisterItem mirroredItem{
    {"mirrored_test_bit_random",
     {"RLBitVec", testMirrored<RLBitVec>},
     bitPeers(testMirrored<std::vector<bool>>, testMirrored<Boost>, TESSAL_LLVM_BODY(testMirrored)),
     {"byte and", testMirrored<Bytes>},
     1.35,
     1.35}};

// ---- Hex text.

void addHexOurs(State& state) {
    LRBitVec vector;
    vector.addHex(hexText().c_str());
    LRBitVec turned;  // the same bits, the first digit of each pair in the high half
    for (std::size_t i = 0; i < vector.length(); ++i) {
        turned.addBit(vector.testBit(i ^ 7));
    }
    agree(state, "add_hex", bytesOf(turned));
    measure(state, [] {
        LRBitVec made;
        made.addHex(hexText().c_str());
        benchmark::DoNotOptimize(made.data());
    });
}

#ifdef TESSAL_HAS_SODIUM
void addHexSodium(State& state) {
    Bytes bytes(digitCount / 2);
    const auto decode = [&] {
        std::size_t size = 0;
        return sodium_hex2bin(bytes.data(), bytes.size(), hexText().c_str(), hexText().size(), nullptr, &size, nullptr);
    };
    decode();
    agree(state, "add_hex", bytes);
    measure(state, decode);
}
#endif

void copyTextLimit(State& state) {
    std::vector<char> copy(digitCount);
    measure(state, [&] {
        std::memcpy(copy.data(), hexText().data(), copy.size());
        benchmark::DoNotOptimize(copy.data());
    });
}

const RegisterItem addHexItem{{"add_hex",
                               {"LRBitVec", addHexOurs},
#ifdef TESSAL_HAS_SODIUM
                               {{"libsodium", addHexSodium}},
#else
                               {},
#endif
                               {"memcpy of the text", copyTextLimit},
                               0.08,
                               4.50}};

// ---- Registers: 24 bits of address, 1 Mi bits of data, 5 bits of status.

constexpr int addressBits = 24;
constexpr int statusBits = 5;
constexpr std::size_t totalBits = joinedBits + addressBits + statusBits;

void rebuildOurs(State& state) {
    Register reg(addressBits, second().data(), static_cast<int>(joinedBits), first().data(), statusBits, 0x15);
    const auto rebuild = [&] {
        reg.updateTotalData();
        return reg.getRegister();
    };
    agree(state, "register_rebuild", bytesOf(*rebuild()));
    measure(state, [&] { benchmark::DoNotOptimize(rebuild()); });
}

void rebuildBoost(State& state) {
    const Boost address = make<Boost>(second(), addressBits);
    const Boost data = make<Boost>(first(), joinedBits);
    const Boost status(statusBits, 0x15);
    Boost total(totalBits);
    const auto put = [&](const Boost& part, std::size_t first) {
        Boost moved(part);
        moved.resize(totalBits);
        moved <<= first;
        total |= moved;
    };
    const auto rebuild = [&] {
        total.reset();
        put(status, 0);
        put(data, statusBits);
        put(address, statusBits + joinedBits);
    };
    rebuild();
    agree(state, "register_rebuild", bytesOf(total));
    measure(state, rebuild);
}

void splitOurs(State& state) {
    Register reg(addressBits, static_cast<int>(joinedBits), statusBits);
    *reg.getRegister() = make<RLBitVec>(first(), totalBits);
    const auto split = [&] {
        reg.updateData();
        return reg.getDataVector();
    };
    agree(state, "register_split", bytesOf(*split()));
    measure(state, [&] { benchmark::DoNotOptimize(split()); });
}

void splitBoost(State& state) {
    const Boost total = make<Boost>(first(), totalBits);
    const auto split = [&] {
        Boost data(total);
        data >>= statusBits;
        data.resize(joinedBits);
        return data;
    };
    agree(state, "register_split", bytesOf(split()));
    measure(state, [&] { benchmark::DoNotOptimize(split()); });
}

void equalOurs(State& state) {
    Register a(addressBits, second().data(), static_cast<int>(joinedBits), first().data(), statusBits, 0x15);
    Register b(addressBits, second().data(), static_cast<int>(joinedBits), first().data(), statusBits, 0x0A);
    agree(state, "register_equal", {static_cast<unsigned char>(a == b)});
    measure(state, [&] { benchmark::DoNotOptimize(a == b); });
}

void equalBoost(State& state) {
    Boost mask(totalBits);
    mask.set(statusBits, totalBits - statusBits, true);
    const Boost a = make<Boost>(first(), totalBits);
    Boost b = a;
    b.flip(0);
    const auto equal = [&] { return (a & mask) == (b & mask); };
    agree(state, "register_equal", {static_cast<unsigned char>(equal())});
    measure(state, [&] { benchmark::DoNotOptimize(equal()); });
}

void smallCompareLimit(State& state) {
    const Bytes copy(first().begin(), first().begin() + joinedBits / 8);
    measure(state, [&] {
        benchmark::DoNotOptimize(copy.data());
        benchmark::DoNotOptimize(std::memcmp(copy.data(), first().data(), copy.size()));
    });
}

const RegisterItem registerItems[]{RegisterItem({"register_rebuild",
                                                 {"Register", rebuildOurs},
                                                 {{"dynamic_bitset", rebuildBoost}},
                                                 {"shifted copy", shiftedCopyLimit<joinedBits>},
                                                 0.40,
                                                 1.40}),
                                   RegisterItem({"register_split",
                                                 {"Register", splitOurs},
                                                 {{"dynamic_bitset", splitBoost}},
                                                 {"shifted copy", shiftedCopyLimit<joinedBits>},
                                                 0.95,
                                                 1.40}),
                                   RegisterItem({"register_equal",
                                                 {"Register", equalOurs},
                                                 {{"dynamic_bitset", equalBoost}},
                                                 {"memcmp", smallCompareLimit},
                                                 0.20,
                                                 1.50})};

}  // namespace
