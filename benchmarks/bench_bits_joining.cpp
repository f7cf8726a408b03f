// Joining, and updating a field, at bits that begin no byte.

#include <cstring>
#include <memory>

#include "BitSets.h"
#include "Item.h"
#include "RLBitVec.h"
#include "ShiftedWords.h"

namespace {

using namespace BitSets;

constexpr std::size_t fieldStart = 13;
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

}  // namespace
