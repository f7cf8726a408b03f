// Hex and binary text to and from vectors, and reversed bytes: 8 Mi bits or 1 Mi characters a call.
//
// The peers decode or encode in their own order, which is one of those that ours has; every side's result is compared
// before its clock starts.

#include <algorithm>
#include <boost/dynamic_bitset.hpp>
#include <cstdlib>
#include <cstring>
#include <memory>
#include <random>
#include <stdexcept>
#include <string>
#include <vector>
#if __has_include(<llvm/Support/MathExtras.h>)
#include <llvm/Support/MathExtras.h>
#define TESSAL_HAS_LLVM
#endif
#ifdef TESSAL_HAS_CRYPTO
#include <openssl/crypto.h>
#endif
#ifdef TESSAL_HAS_SODIUM
#include <sodium.h>
#endif

#include "Hex2Bit.h"
#include "benchmarks/Item.h"

namespace {

using State = benchmark::State;
using Bytes = std::vector<unsigned char>;

constexpr std::size_t characterCount = std::size_t{1} << 20;

// ---- Inputs, made once.

Bytes randomBytes(std::size_t count) {
    std::mt19937_64 random(8);
    Bytes bytes(count);
    for (unsigned char& byte : bytes) {
        byte = static_cast<unsigned char>(random());
    }
    return bytes;
}

const Bytes& bytesOf(std::size_t count) {
    static const Bytes mib = randomBytes(characterCount);
    static const Bytes half(mib.begin(), mib.begin() + characterCount / 2);
    static const Bytes eighth(mib.begin(), mib.begin() + characterCount / 8);
    return count == mib.size() ? mib : count == half.size() ? half : eighth;
}

const Bytes& digitBytes() {
    return bytesOf(characterCount / 2);
}

const Bytes& bitBytes() {
    return bytesOf(characterCount / 8);
}

unsigned char mirrored(unsigned char byte) {
    unsigned result = 0;
    for (int bit = 0; bit < 8; ++bit) {
        result = result << 1 | (byte >> bit & 1U);
    }
    return static_cast<unsigned char>(result);
}

/// Hex text of the bytes, digit by digit.
const std::string& hexText() {
    static const std::string text = [] {
        std::string result;
        for (const unsigned char byte : digitBytes()) {
            result.push_back("0123456789abcdef"[byte >> 4]);
            result.push_back("0123456789ABCDEF"[byte & 15]);
        }
        return result;
    }();
    return text;
}

/// Binary text of the bits, from the first byte's lowest bit up.
const std::string& binaryText() {
    static const std::string text = [] {
        std::string result;
        for (std::size_t bit = 0; bit < characterCount; ++bit) {
            result.push_back((bitBytes()[bit / 8] >> bit % 8 & 1) != 0 ? '1' : '0');
        }
        return result;
    }();
    return text;
}

void check(bool equal) {
    if (!equal) {
        throw std::runtime_error("A side of the table gives a wrong result.");
    }
}

Bytes reordered(Bytes bytes, bool lastFirst, bool mirrorBits) {
    if (lastFirst) {
        std::reverse(bytes.begin(), bytes.end());
    }
    if (mirrorBits) {
        std::transform(bytes.begin(), bytes.end(), bytes.begin(), mirrored);
    }
    return bytes;
}

std::string lowerCase(std::string text) {
    std::transform(text.begin(), text.end(), text.begin(),
                   [](char c) { return c >= 'A' && c <= 'F' ? static_cast<char>(c + 32) : c; });
    return text;
}

/// Times the work. It runs twice before the clock starts, so that memory which it takes and gives back is the process's
/// already: page faults of the first calls would be most of what few iterations show.
template <class Work>
void measure(State& state, Work work) {
    work();
    work();
    for (auto _ : state) {
        work();
        benchmark::ClobberMemory();
    }
}

// ---- Loading hex text.

template <bool descending, bool byteSwap>
void loadHexOurs(State& state) {
    const std::string& text = hexText();
    RLBitVec vector(4 * text.size());
    const auto load = [&] {
        Hex2Bit::convertHexString2BitVec(&vector, text.c_str(), 4 * characterCount, descending, byteSwap, false);
    };
    load();
    check(reordered(digitBytes(), !descending, descending != byteSwap) ==
          Bytes(vector.data(), vector.data() + characterCount / 2));
    measure(state, load);
}

template <class Unit>
void copyOf(State& state, const Unit* source, std::size_t count) {
    std::vector<Unit> target(count);
    measure(state, [&] {
        benchmark::DoNotOptimize(source);
        std::memcpy(target.data(), source, count);
        benchmark::DoNotOptimize(target.data());
    });
}

template <class Unit>
void newCopyOf(State& state, const Unit* source, std::size_t count) {
    measure(state, [&] {
        const std::unique_ptr<Unit[]> target(new Unit[count]);
        std::memcpy(target.get(), source, count);
        benchmark::DoNotOptimize(target.get());
    });
}

void copyHexText(State& state) {
    copyOf(state, hexText().c_str(), characterCount);
}

// ---- Making hex text.

template <bool positionOrder, bool byteMode>
char* makeHex() {
    return Hex2Bit::convertBinData2HexString(digitBytes().data(), 4 * characterCount, positionOrder, byteMode);
}

template <bool positionOrder, bool byteMode>
void makeHexOurs(State& state) {
    const std::unique_ptr<char[]> text(makeHex<positionOrder, byteMode>());
    std::string expected;
    for (const unsigned char byte : reordered(digitBytes(), !positionOrder, positionOrder != byteMode)) {
        expected.push_back("0123456789abcdef"[byte >> 4]);
        expected.push_back("0123456789abcdef"[byte & 15]);
    }
    check(expected == text.get());
    measure(state, [&] {
        const std::unique_ptr<char[]> result(makeHex<positionOrder, byteMode>());
        benchmark::DoNotOptimize(result.get());
    });
}

void newCopyOfText(State& state) {
    newCopyOf(state, hexText().c_str(), characterCount + 1);
}

#ifdef TESSAL_HAS_SODIUM
void loadHexSodium(State& state) {
    Bytes bytes(characterCount / 2);
    const auto load = [&] {
        return sodium_hex2bin(bytes.data(), bytes.size(), hexText().c_str(), characterCount, nullptr, nullptr, nullptr);
    };
    check(load() == 0 && bytes == digitBytes());
    measure(state, [&] { benchmark::DoNotOptimize(load()); });
}

void makeHexSodium(State& state) {
    const auto make = [](char* text) {
        sodium_bin2hex(text, characterCount + 1, digitBytes().data(), digitBytes().size());
    };
    std::string text(characterCount + 1, '?');
    make(text.data());
    check(lowerCase(hexText()) == text.c_str());
    measure(state, [&] {
        const std::unique_ptr<char[]> result(new char[characterCount + 1]);
        make(result.get());
        benchmark::DoNotOptimize(result.get());
    });
}
#endif

#ifdef TESSAL_HAS_CRYPTO
void makeHexOpenSsl(State& state) {
    const auto make = [](char* text) {
        std::size_t written = 0;
        return OPENSSL_buf2hexstr_ex(text, characterCount + 1, &written, digitBytes().data(), digitBytes().size(),
                                     '\0');
    };
    std::string text(characterCount + 1, '?');
    check(make(text.data()) == 1 && lowerCase(hexText()) == lowerCase(text.c_str()));
    measure(state, [&] {
        const std::unique_ptr<char[]> result(new char[characterCount + 1]);
        benchmark::DoNotOptimize(make(result.get()));
        benchmark::DoNotOptimize(result.get());
    });
}
#endif

std::vector<Side> hexReaders() {
#ifdef TESSAL_HAS_SODIUM
    return {{"libsodium", loadHexSodium}};
#else
    return {};
#endif
}

std::vector<Side> hexWriters() {
    std::vector<Side> sides;
#ifdef TESSAL_HAS_CRYPTO
    sides.push_back({"OpenSSL", makeHexOpenSsl});
#endif
#ifdef TESSAL_HAS_SODIUM
    sides.push_back({"libsodium", makeHexSodium});
#endif
    return sides;
}

// ---- Binary text.

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

// ---- Reversed bytes.

void reverseNewOurs(State& state) {
    const Bytes& bytes = bytesOf(characterCount);
    const auto reverse = [&] {
        return std::unique_ptr<unsigned char[]>(
            Hex2Bit::reverseBufferBits(bytes.data(), static_cast<int>(bytes.size())));
    };
    const auto once = reverse();
    check(reordered(bytes, false, true) == Bytes(once.get(), once.get() + bytes.size()));
    measure(state, [&] {
        const auto result = reverse();
        benchmark::DoNotOptimize(result.get());
    });
}

void reverseInPlaceOurs(State& state) {
    Bytes bytes = bytesOf(characterCount);
    const auto reverse = [&] { Hex2Bit::reverseReadBufferBits(bytes.data(), static_cast<int>(bytes.size())); };
    reverse();
    check(reordered(bytesOf(characterCount), false, true) == bytes);
    measure(state, reverse);
}

void newCopyOfBytes(State& state) {
    newCopyOf(state, bytesOf(characterCount).data(), characterCount);
}

void copyBytes(State& state) {
    copyOf(state, bytesOf(characterCount).data(), characterCount);
}

#ifdef TESSAL_HAS_LLVM
void reverseAll(const unsigned char* from, unsigned char* to) {
    for (std::size_t i = 0; i < characterCount; ++i) {
        to[i] = llvm::reverseBits(from[i]);
    }
}

void reverseNewLlvm(State& state) {
    const Bytes& bytes = bytesOf(characterCount);
    Bytes once(bytes.size());
    reverseAll(bytes.data(), once.data());
    check(reordered(bytes, false, true) == once);
    measure(state, [&] {
        const std::unique_ptr<unsigned char[]> result(new unsigned char[characterCount]);
        reverseAll(bytes.data(), result.get());
        benchmark::DoNotOptimize(result.get());
    });
}

void reverseInPlaceLlvm(State& state) {
    Bytes bytes = bytesOf(characterCount);
    reverseAll(bytes.data(), bytes.data());
    check(reordered(bytesOf(characterCount), false, true) == bytes);
    measure(state, [&] { reverseAll(bytes.data(), bytes.data()); });
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

// ---- Eight digits to a number.

template <int (*convert)(const char*, int)>
void hexToInt(State& state) {
    const char* text = "1f2E3d4C";
    check(convert(text, 8) == 0x1F2E3D4C);
    for (auto _ : state) {
        benchmark::DoNotOptimize(text);
        benchmark::DoNotOptimize(convert(text, 8));
    }
}

int byStrtoul(const char* text, int /*digits*/) {
    return static_cast<int>(std::strtoul(text, nullptr, 16));
}

int byDigitLoop(const char* text, int digits) {
    unsigned number = 0;
    for (int i = 0; i < digits; ++i) {
        const char c = text[i];
        number = number << 4 | static_cast<unsigned>(c <= '9' ? c - '0' : (c | 0x20) - 'a' + 10);
    }
    return static_cast<int>(number);
}

RegisterItem loading(const char* name, BenchmarkBody ours) {
    return RegisterItem({name, {"Hex2Bit", ours}, hexReaders(), {"memcpy of the text", copyHexText}, 0.06, 3.50});
}

RegisterItem making(const char* name, BenchmarkBody ours) {
    return RegisterItem({name, {"Hex2Bit", ours}, hexWriters(), {"new, memcpy", newCopyOfText}, 0.15, 2.50});
}

RegisterItem makingBinary(const char* name, BenchmarkBody ours) {
    return RegisterItem(
        {name, {"Hex2Bit", ours}, {{"bit loop", makeBinaryBitLoop}}, {"new, memcpy", newCopyOfText}, 0.15, 3.00});
}

const RegisterItem items[] = {
    loading("load_hex_up", loadHexOurs<false, false>),
    loading("load_hex_up_swapped", loadHexOurs<false, true>),
    loading("load_hex_down", loadHexOurs<true, false>),
    loading("load_hex_down_swapped", loadHexOurs<true, true>),
    making("to_hex_number", makeHexOurs<false, false>),
    making("to_hex_number_bytes", makeHexOurs<false, true>),
    making("to_hex_position", makeHexOurs<true, false>),
    making("to_hex_position_bytes", makeHexOurs<true, true>),
    makingBinary("to_binary_number", makeBinaryOurs<false>),
    makingBinary("to_binary_position", makeBinaryOurs<true>),
    RegisterItem({"load_binary",
                  {"Hex2Bit", loadBinaryOurs},
                  {{"dynamic_bitset", loadBinaryBoost}},
                  {"memcpy of the text", copyBinaryText},
                  0.02,
                  2.30}),
    RegisterItem(
        {"reverse_bits_new", {"Hex2Bit", reverseNewOurs}, newReversers(), {"new, memcpy", newCopyOfBytes}, 0.10, 1.60}),
    RegisterItem({"reverse_bits_in_place",
                  {"Hex2Bit", reverseInPlaceOurs},
                  reversersInPlace(),
                  {"memcpy", copyBytes},
                  0.10,
                  1.60}),
    RegisterItem({"hex_to_int",
                  {"Hex2Bit", hexToInt<Hex2Bit::convertHexString2Int>},
                  {{"strtoul", hexToInt<byStrtoul>}},
                  {"digit loop", hexToInt<byDigitLoop>},
                  0.80,
                  2.50}),
};

}  // namespace
