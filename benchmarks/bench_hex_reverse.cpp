// Bytes with their bits reversed: 1 MiB a call.
#if __has_include(<llvm/Support/MathExtras.h>)
#include <llvm/Support/MathExtras.h>
#define TESSAL_HAS_LLVM
#endif

#include "Hex2Bit.h"
#include "HexTexts.h"

namespace {

using namespace HexTexts;

void reverseNewOurs(State& state) {
    const Bytes& source = bytes();
    const auto reverse = [&] {
        return std::unique_ptr<unsigned char[]>(
            Hex2Bit::reverseBufferBits(source.data(), static_cast<int>(source.size())));
    };
    const auto once = reverse();
    check(reordered(source, false, true) == Bytes(once.get(), once.get() + source.size()));
    measure(state, [&] {
        const auto result = reverse();
        benchmark::DoNotOptimize(result.get());
    });
}

void reverseInPlaceOurs(State& state) {
    Bytes copy = bytes();
    const auto reverse = [&] { Hex2Bit::reverseReadBufferBits(copy.data(), static_cast<int>(copy.size())); };
    reverse();
    check(reordered(bytes(), false, true) == copy);
    measure(state, reverse);
}

void newCopyOfBytes(State& state) {
    newCopyOf(state, bytes().data(), characterCount);
}

void copyBytes(State& state) {
    copyOf(state, bytes().data(), characterCount);
}

#ifdef TESSAL_HAS_LLVM
void reverseAll(const unsigned char* from, unsigned char* to) {
    for (std::size_t i = 0; i < characterCount; ++i) {
        to[i] = llvm::reverseBits(from[i]);
    }
}

void reverseNewLlvm(State& state) {
    const Bytes& source = bytes();
    Bytes once(source.size());
    reverseAll(source.data(), once.data());
    check(reordered(source, false, true) == once);
    measure(state, [&] {
        const std::unique_ptr<unsigned char[]> result(new unsigned char[characterCount]);
        reverseAll(source.data(), result.get());
        benchmark::DoNotOptimize(result.get());
    });
}

void reverseInPlaceLlvm(State& state) {
    Bytes copy = bytes();
    reverseAll(copy.data(), copy.data());
    check(reordered(bytes(), false, true) == copy);
    measure(state, [&] { reverseAll(copy.data(), copy.data()); });
}
#endif

std::vector<Side> newReversers() {
#ifdef TESSAL_HAS_LLVM
    return {{"llvm reverseBits", reverseNewLlvm}};
#else
    return {};
#endif
}

std::vector<Side> reversersInPlace() {
#ifdef TESSAL_HAS_LLVM
    return {{"llvm reverseBits", reverseInPlaceLlvm}};
#else
    return {};
#endif
}

const RegisterItem items[] = {
    RegisterItem(
        {"reverse_bits_new", {"Hex2Bit", reverseNewOurs}, newReversers(), {"new, memcpy", newCopyOfBytes}, 0.10, 1.60}),
    RegisterItem({"reverse_bits_in_place",
                  {"Hex2Bit", reverseInPlaceOurs},
                  reversersInPlace(),
                  {"memcpy", copyBytes},
                  0.10,
                  1.60}),
};

}  // namespace
