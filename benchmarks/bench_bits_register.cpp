// Registers: 24 bits of address, 1 Mi bits of data, 5 bits of status.

#include <cstring>
#include <memory>

#include "BitSets.h"
#include "Item.h"
#include "Register.h"
#include "ShiftedWords.h"

namespace {

using namespace BitSets;

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
