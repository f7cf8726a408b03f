// Binary text to and from vectors: 1 Mi characters a call.
#include <algorithm>
#include <boost/dynamic_bitset.hpp>

#include "Hex2Bit.h"
#include "HexTexts.h"

namespace {

using namespace HexTexts;

template <bool positionOrder>
void makeBinaryOurs(State& state) {
    const auto make = [] {
        return std::unique_ptr<char[]>(
            Hex2Bit::convertBinData2BinString(bitBytes().data(), characterCount, positionOrder));
    };
    std::string expected = binaryText();
    if (!positionOrder) {
        std::reverse(expected.begin(), expected.end());
    }
    check(expected == make().get());
    measure(state, [&] {
        const auto result = make();
        benchmark::DoNotOptimize(result.get());
    });
}

void makeBinaryBitLoop(State& state) {
    const unsigned char* const bytes = bitBytes().data();
    const auto make = [bytes] {
        std::unique_ptr<char[]> text(new char[characterCount + 1]);
        for (std::size_t bit = 0; bit < characterCount; ++bit) {
            text[bit] = static_cast<char>('0' + (bytes[bit / 8] >> bit % 8 & 1));
        }
        text[characterCount] = '\0';
        return text;
    };
    check(binaryText() == make().get());
    measure(state, [&] {
        const auto result = make();
        benchmark::DoNotOptimize(result.get());
    });
}

void loadBinaryOurs(State& state) {
    RLBitVec vector(characterCount);
    const auto load = [&] { Hex2Bit::convertBinString2BitVec(&vector, binaryText().c_str(), characterCount, true); };
    load();
    check(std::equal(bitBytes().begin(), bitBytes().end(), vector.data()));
    measure(state, load);
}

void loadBinaryBoost(State& state) {
    const std::string reversed(binaryText().rbegin(), binaryText().rend());
    boost::dynamic_bitset<std::uint64_t> made(reversed);
    for (std::size_t bit = 0; bit < characterCount; ++bit) {
        check(made[bit] == (binaryText()[bit] == '1'));
    }
    measure(state, [&] {
        const boost::dynamic_bitset<std::uint64_t> result(reversed);
        benchmark::DoNotOptimize(result.size());
    });
}

void copyBinaryText(State& state) {
    copyOf(state, binaryText().c_str(), characterCount);
}

RegisterItem makingBinary(const char* name, BenchmarkBody ours) {
    return RegisterItem(
        {name, {"Hex2Bit", ours}, {{"bit loop", makeBinaryBitLoop}}, {"new, memcpy", newCopyOfText}, 0.15, 3.00});
}

const RegisterItem items[] = {
    makingBinary("to_binary_number", makeBinaryOurs<false>),
    makingBinary("to_binary_position", makeBinaryOurs<true>),
    RegisterItem({"load_binary",
                  {"Hex2Bit", loadBinaryOurs},
                  {{"dynamic_bitset", loadBinaryBoost}},
                  {"memcpy of the text", copyBinaryText},
                  0.02,
                  2.30}),
};

}  // namespace
