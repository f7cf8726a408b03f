// Hex text of 1 Mi digits into a vector.

#include <cstring>
#include <string>
#include <vector>

#ifdef TESSAL_HAS_SODIUM
#include <sodium.h>
#endif

#include "BitSets.h"
#include "Item.h"

namespace {

using namespace BitSets;

constexpr std::size_t digitCount = std::size_t{1} << 20;

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

}  // namespace
