// Every small run of bits, at every offset, in arrays of exactly its bytes, for both widths of block.
#include <gtest/gtest.h>

#include <random>

#include "Model.h"
#include "VectorWidth.h"
#include "s/BitKernels.h"

namespace {

using namespace BitKernels;

std::mt19937 randomNumber{5};

/// An array that ends with the run.
Model array(std::size_t first, std::size_t count) {
    Model model;
    model.bytes.resize((first + count + 7) / 8);
    std::generate(model.bytes.begin(), model.bytes.end(), std::ref(randomNumber));
    return model;
}

template <class Check>
void eachRun(Check check) {
    for (std::size_t run = 0; run < std::size_t{2} * 72 * 136; ++run) {
        const VectorWidth width(run % 2 != 0);
        check(run / 2 / 136, run / 2 % 136);
    }
}

/// From an array that ends with the run, and inside one.
void checkCopy(std::size_t first, std::size_t from, std::size_t count) {
    const Model source = array(std::max(first, from), count);
    Model target = array(first, count);
    Model expected = target;
    Model moved = source;
    for (std::size_t i = 0; i < count; ++i) {
        expected.put(first + i, source.bit(from + i));
        moved.put(first + i, source.bit(from + i));
    }
    const auto start = source.bytes.begin();
    const std::vector<unsigned char> exact(start, start + static_cast<int>(from + count + 7) / 8);
    copyBits(target.bytes.data(), first, exact.data(), from, count);
    ASSERT_EQ(target.bytes, expected.bytes) << count << " bits from " << from << " to " << first;
    Model own = source;
    copyBits(own.bytes.data(), first, own.bytes.data(), from, count);
    ASSERT_EQ(own.bytes, moved.bytes) << count << " bits inside, from " << from << " to " << first;
}

TEST(Kernels, CopyBetweenArraysAndInsideOne) {
    eachRun([](std::size_t first, std::size_t count) {
        for (const std::size_t from : {first, std::size_t{0}, std::size_t{5}, std::size_t{16}, std::size_t{71}}) {
            checkCopy(first, from, count);
        }
    });
}

TEST(Kernels, CopyOfLongRunsAtAnyPlaceInACacheLine) {
    for (unsigned trial = 0; trial < 1500; ++trial) {
        const VectorWidth width(trial % 4 != 0, trial % 2 != 0);
        const std::size_t first = randomNumber() % 1100;
        const std::size_t from = trial % 3 == 0 ? randomNumber() % 1100 : first + randomNumber() % 40;
        checkCopy(first, from, 4000 + randomNumber() % 3000);
        checkCopy(from, first, 4000 + randomNumber() % 3000);
    }
}

TEST(Kernels, FillFindCompareCountAndHash) {
    eachRun([](std::size_t first, std::size_t count) {
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
                const std::size_t odd = first + randomNumber() % count;
                const std::size_t hash = hashBits(bytes, first, count);
                filled.put(odd, !value);
                ASSERT_EQ(findBit(bytes, first, count, !value), odd);
                ASSERT_FALSE(equalBits(bytes, expected.bytes.data(), first, count));
                ASSERT_NE(hashBits(bytes, first, count), hash);
            }
        }
    });
}

}  // namespace
