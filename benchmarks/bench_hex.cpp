// Hex text to and from vectors, 1 Mi characters a call, and eight digits to a number.
#include <cstdlib>
#ifdef TESSAL_HAS_CRYPTO
#include <openssl/crypto.h>
#endif
#ifdef TESSAL_HAS_SODIUM
#include <sodium.h>
#endif

#include "Hex2Bit.h"
#include "HexTexts.h"

namespace {

using namespace HexTexts;

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

void copyHexText(State& state) {
    copyOf(state, hexText().c_str(), characterCount);
}

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

const RegisterItem items[] = {
    loading("load_hex_up", loadHexOurs<false, false>),
    loading("load_hex_up_swapped", loadHexOurs<false, true>),
    loading("load_hex_down", loadHexOurs<true, false>),
    loading("load_hex_down_swapped", loadHexOurs<true, true>),
    making("to_hex_number", makeHexOurs<false, false>),
    making("to_hex_number_bytes", makeHexOurs<false, true>),
    making("to_hex_position", makeHexOurs<true, false>),
    making("to_hex_position_bytes", makeHexOurs<true, true>),
    RegisterItem({"hex_to_int",
                  {"Hex2Bit", hexToInt<Hex2Bit::convertHexString2Int>},
                  {{"strtoul", hexToInt<byStrtoul>}},
                  {"digit loop", hexToInt<byDigitLoop>},
                  0.80,
                  2.50}),
};

}  // namespace
