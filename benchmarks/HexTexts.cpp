#include "HexTexts.h"

#include <algorithm>
#include <random>
#include <stdexcept>

namespace HexTexts {
namespace {

Bytes randomBytes(std::size_t count) {
    std::mt19937_64 random(8);
    Bytes bytes(count);
    for (unsigned char& byte : bytes) {
        byte = static_cast<unsigned char>(random());
    }
    return bytes;
}

Bytes firstOf(const Bytes& bytes, std::size_t count) {
    return Bytes(bytes.begin(), bytes.begin() + static_cast<std::ptrdiff_t>(count));
}

unsigned char mirrored(unsigned char byte) {
    unsigned result = 0;
    for (int bit = 0; bit < 8; ++bit) {
        result = result << 1 | (byte >> bit & 1U);
    }
    return static_cast<unsigned char>(result);
}

}  // namespace

const Bytes& bytes() {
    static const Bytes result = randomBytes(characterCount);
    return result;
}

const Bytes& digitBytes() {
    static const Bytes result = firstOf(bytes(), characterCount / 2);
    return result;
}

const Bytes& bitBytes() {
    static const Bytes result = firstOf(bytes(), characterCount / 8);
    return result;
}

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

void newCopyOfText(State& state) {
    newCopyOf(state, hexText().c_str(), characterCount + 1);
}

}  // namespace HexTexts
