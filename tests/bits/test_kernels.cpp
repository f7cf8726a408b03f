// Every small run of bits, at every offset, in arrays of exactly its bytes, for both widths of block.
#include <gtest/gtest.h>

#include <functional>
#include <random>

#include "Model.h"
#include "VectorWidth.h"
#include "s/BitKernels.h"

namespace {

using namespace BitKernels;

class Kernels : public testing::TestWithParam<bool> {
protected:
    /// An array that ends with the run.
    Model array(std::size_t first, std::size_t count) {
        Model model;
        model.length = first + count;
        model.bytes.resize((first + count + 7) / 8);
        for (unsigned char& byte : model.bytes) {
            byte = static_cast<unsigned char>(m_random());
        }
        return model;
    }

    static void eachRun(const std::function<void(std::size_t, std::size_t)>& check) {
        for (std::size_t run = 0; run < std::size_t{72} * 136; ++run) {
            check(run / 136, run % 136);
        }
    }

    /// The copy bit by bit.
    static Model copied(Model target, std::size_t first, const Model& source, std::size_t from, std::size_t count) {
        for (std::size_t i = 0; i < count; ++i) {
            target.put(first + i, source.bit(from + i));
        }
        return target;
    }

    std::mt19937 m_random{5};

private:
    const VectorWidth m_width{GetParam()};
};

TEST_P(Kernels, CopyBetweenArraysAndInsideOne) {
    eachRun([this](std::size_t first, std::size_t count) {
        for (const std::size_t from : {first, std::size_t{0}, std::size_t{5}, std::size_t{16}, std::size_t{71}}) {
            const Model source = array(from, count);
            Model target = array(first, count);
            const Model expected = copied(target, first, source, from, count);
            copyBits(target.bytes.data(), first, source.bytes.data(), from, count);
            ASSERT_EQ(target.bytes, expected.bytes) << count << " bits from " << from << " to " << first;

            Model own = array(std::max(first, from), count);
            const Model moved = copied(own, first, Model(own), from, count);
            copyBits(own.bytes.data(), first, own.bytes.data(), from, count);
            ASSERT_EQ(own.bytes, moved.bytes) << count << " bits inside, from " << from << " to " << first;
        }
    });
}

TEST_P(Kernels, FillFindCompareCountAndHash) {
    eachRun([this](std::size_t first, std::size_t count) {
        const Model model = array(first, count);
        for (const bool value : {false, true}) {
            Model expected = model;
            for (std::size_t i = first; i < first + count; ++i) {
                expected.put(i, value);
            }
            Model filled = model;
            unsigned char* const bytes = filled.bytes.data();
            fillBits(bytes, first, count, value);
            ASSERT_EQ(filled.bytes, expected.bytes);
            ASSERT_EQ(findBit(bytes, first, count, !value), first + count);
            ASSERT_EQ(countOnes(bytes, first, count), value ? count : 0);
            ASSERT_EQ(equalBits(bytes, model.bytes.data(), first, count),
                      countOnes(model.bytes.data(), first, count) == (value ? count : 0));
            if (count != 0) {
                const std::size_t odd = first + m_random() % count;
                const std::size_t hash = hashBits(bytes, first, count);
                filled.put(odd, !value);
                ASSERT_EQ(findBit(bytes, first, count, !value), odd);
                ASSERT_FALSE(equalBits(bytes, expected.bytes.data(), first, count));
                ASSERT_NE(hashBits(bytes, first, count), hash);
            }
        }
    });
}

INSTANTIATE_TEST_SUITE_P(Width, Kernels, testing::Bool(),
                         [](const auto& width) { return width.param ? "Wide" : "Narrow"; });

}  // namespace
