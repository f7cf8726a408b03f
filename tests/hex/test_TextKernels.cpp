// Each form of the inner loops against what one byte or character means, for all lengths around the vector widths.
#include <gtest/gtest.h>

#include <random>
#include <string>
#include <vector>

#include "hex/HexModel.h"
#include "s/TextKernels.h"

namespace {

using Bytes = std::vector<unsigned char>;

constexpr std::size_t longest = 140;

Bytes ordered(Bytes bytes, ByteOrder order) {
    if (order.lastByteFirst) {
        bytes = Bytes(bytes.rbegin(), bytes.rend());
    }
    if (order.mirrorBits) {
        for (unsigned char& byte : bytes) {
            byte = HexModel::mirrored(byte);
        }
    }
    return bytes;
}

std::vector<const TextKernels*> forms() {
    std::vector<const TextKernels*> result{&portableTextKernels()};
    if (wideTextKernels() != nullptr) {
        result.push_back(wideTextKernels());
    }
    return result;
}

class TextKernelsTest : public testing::TestWithParam<const TextKernels*> {
protected:
    Bytes randomBytes(std::size_t count) {
        Bytes bytes(count);
        for (unsigned char& byte : bytes) {
            byte = static_cast<unsigned char>(m_random());
        }
        return bytes;
    }

    std::mt19937 m_random{20261124};
};

constexpr ByteOrder allOrders[] = {{false, false}, {false, true}, {true, false}, {true, true}};

TEST_P(TextKernelsTest, HexTextAndBytesInAllOrders) {
    for (std::size_t count = 0; count <= longest; ++count) {
        for (const ByteOrder order : allOrders) {
            std::string text(2 * count, '0');
            Bytes plain(count);
            for (std::size_t i = 0; i < text.size(); ++i) {
                text[i] = "0123456789abcdefABCDEF"[m_random() % 22];
                plain[i / 2] = static_cast<unsigned char>(plain[i / 2] << 4 | HexModel::digitValue(text[i]));
            }
            Bytes bytes(count);
            ASSERT_TRUE(GetParam()->decodeHex(text.data(), count, order, bytes.data()));
            ASSERT_EQ(bytes, ordered(plain, order)) << text;

            std::string back(2 * count, '?');
            GetParam()->encodeHex(bytes.data(), count, order, back.data());
            for (char& character : text) {
                character = static_cast<char>(std::tolower(static_cast<unsigned char>(character)));
            }
            ASSERT_EQ(back, text);
        }
    }
}

TEST_P(TextKernelsTest, EveryCharacterInEveryPlaceIsJudged) {
    for (const std::size_t count : {1U, 31U, 32U, 65U}) {
        Bytes bytes(count);
        for (std::size_t place = 0; place < 2 * count; ++place) {
            for (int character = 0; character < 256; ++character) {
                std::string text(2 * count, '0');
                text[place] = static_cast<char>(character);
                ASSERT_EQ(GetParam()->decodeHex(text.data(), count, {false, false}, bytes.data()),
                          HexModel::digitValue(text[place]) >= 0)
                    << character << " at " << place;
            }
        }
    }
}

TEST_P(TextKernelsTest, BinaryTextAndBits) {
    for (std::size_t count = 0; count <= longest / 4; ++count) {
        const Bytes bytes = randomBytes(count);
        std::string text;
        for (std::size_t bit = 0; bit < 8 * count; ++bit) {
            text.push_back((bytes[bit / 8] >> bit % 8 & 1U) != 0 ? '1' : '0');
        }
        std::string made(8 * count, '?');
        GetParam()->unpackBits(bytes.data(), count, false, made.data());
        EXPECT_EQ(made, text);
        GetParam()->unpackBits(bytes.data(), count, true, made.data());
        EXPECT_EQ(made, std::string(text.rbegin(), text.rend()));

        Bytes back(count);
        GetParam()->packBits(text.data(), count, BitMark::OnlyOne, false, back.data());
        EXPECT_EQ(back, bytes);
        GetParam()->packBits(made.data(), count, BitMark::AllButZero, true, back.data());
        EXPECT_EQ(back, bytes);
    }
}

TEST_P(TextKernelsTest, OnlyTheMarkedCharactersCountAsOne) {
    std::string text(256, '0');
    for (std::size_t i = 0; i < text.size(); ++i) {
        text[i] = static_cast<char>(i);
    }
    Bytes ones(32);
    Bytes notZeros(32);
    GetParam()->packBits(text.data(), 32, BitMark::OnlyOne, false, ones.data());
    GetParam()->packBits(text.data(), 32, BitMark::AllButZero, false, notZeros.data());
    for (std::size_t i = 0; i < text.size(); ++i) {
        EXPECT_EQ(ones[i / 8] >> i % 8 & 1, i == '1') << i;
        EXPECT_EQ(notZeros[i / 8] >> i % 8 & 1, i != '0') << i;
    }
}

TEST_P(TextKernelsTest, MirroredBytesApartAndInPlace) {
    for (std::size_t count = 0; count <= longest; ++count) {
        Bytes bytes = randomBytes(count);
        const Bytes expected = ordered(bytes, {false, true});
        Bytes result(count);
        GetParam()->mirrorBytes(bytes.data(), count, result.data());
        EXPECT_EQ(result, expected);
        GetParam()->mirrorBytes(bytes.data(), count, bytes.data());
        EXPECT_EQ(bytes, expected);
    }
}

INSTANTIATE_TEST_SUITE_P(Forms, TextKernelsTest, testing::ValuesIn(forms()),
                         [](const auto& form) { return form.param == &portableTextKernels() ? "Portable" : "Wide"; });

}  // namespace
