// Whole vectors of 8 Mi bits against other bit sets and against loops over the same bytes.

#include <cstring>
#include <memory>
#include <utility>

#include "BitSets.h"
#include "Item.h"
#include "RLBitVec.h"

namespace {

using namespace BitSets;

// ---- In place: each operation is a type with a name and one function for each kind of vector.

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

template <class Operation>
Item inPlaceItem(Side limit, double peerGoal, double limitGoal) {
    return {Operation::name,
            {"LRBitVec", inPlace<Operation, LRBitVec>},
            setPeers(inPlace<Operation, Boost>, inPlace<Operation, Llvm>),
            limit,
            peerGoal,
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

const RegisterItem notNewItem{{"not_new_vector",
                               {"LRBitVec", notNew<LRBitVec>},
                               setPeers(notNew<Boost>, notNew<Llvm>),
                               {"new, memcpy", newCopyLimit},
                               0.80,
                               1.30}};
const RegisterItem compareItem{{"compare_equal",
                                {"LRBitVec", compareEqual<LRBitVec>},
                                setPeers(compareEqual<Boost>, compareEqual<Llvm>),
                                {"memcmp", compareLimit},
                                1.10,
                                1.20}};
const RegisterItem firstTrueItem{{"first_true",
                                  {"LRBitVec", firstTrue<LRBitVec>},
                                  setPeers(firstTrue<Boost>, firstTrue<Llvm>),
                                  {"word scan", firstTrueLimit},
                                  1.05,
                                  1.30}};

}  // namespace
