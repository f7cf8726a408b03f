// Each conversion runs with both widths of the kernels, on random data whose seed a failure tells.
#pragma once

#include <gtest/gtest.h>

#include <algorithm>
#include <array>
#include <memory>
#include <random>
#include <string>
#include <vector>

#include "BitView.h"
#include "Hex2Bit.h"
#include "VectorWidth.h"
#include "hex/HexModel.h"

class Hex2BitTest : public testing::TestWithParam<bool> {
protected:
    using Bytes = std::vector<unsigned char>;

    ~Hex2BitTest() override { Hex2Bit::setInitValue(false); }

    std::size_t below(std::size_t limit) { return m_random() % limit; }
    bool coin() { return below(2) != 0; }
    Bytes randomBytes(std::size_t count) {
        Bytes bytes(count);
        for (unsigned char& byte : bytes) {
            byte = static_cast<unsigned char>(m_random());
        }
        return bytes;
    }
    /// The bits by index, 0 first.
    static std::string bitsOf(const RLBitVec& vector) { return toGroupedText(vector, 0); }
    /// The text of a new array, which is released.
    static std::string taken(const char* text) {
        const std::unique_ptr<const char[]> owner(text);
        return text != nullptr ? text : "(null)";
    }

private:
    const unsigned m_seed = std::random_device()();
    std::mt19937 m_random{m_seed};
    const testing::ScopedTrace m_trace{__FILE__, __LINE__, "seed " + std::to_string(m_seed)};
    const VectorWidth m_width{GetParam()};
};
