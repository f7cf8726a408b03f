// Row checksums: the sum of two rows of 1 MiB, and the fill behind the last row.

#include <cstdint>
#include <memory>
#include <numeric>
#include <vector>

#include "HkMessageManager.h"
#include "PromUtility.h"
#include "benchmarks/Item.h"

namespace {

constexpr std::size_t rowBytes = std::size_t{1} << 20;
constexpr int rowBits = static_cast<int>(rowBytes * 8);

std::vector<unsigned char> sampleBytes() {
    std::vector<unsigned char> bytes(rowBytes);
    unsigned int value = 1;
    for (unsigned char& byte : bytes) {
        value = value * 1664525U + 1013904223U;
        byte = static_cast<unsigned char>(value >> 24);
    }
    return bytes;
}

void ignoreMessage(const HkMessage&, void*) {}

void sumOurs(benchmark::State& state) {
    const std::vector<unsigned char> bytes = sampleBytes();
    RLBitVec file(bytes.data(), rowBytes * 8);
    RLBitVec device(bytes.data(), rowBytes * 8);
    int fileSum = 0;
    int deviceSum = 0;
    PromUtility::rowChecksum(0, &file, rowBits, &device, rowBits, false, fileSum, deviceSum, 0, 0);
    if (static_cast<unsigned int>(fileSum) != std::accumulate(bytes.begin(), bytes.end(), 0U)) {
        state.SkipWithError("the sums differ");
    }
    for (auto _ : state) {
        PromUtility::rowChecksum(0, &file, rowBits, &device, rowBits, false, fileSum, deviceSum, 0, 0);
        benchmark::DoNotOptimize(fileSum);
        benchmark::DoNotOptimize(deviceSum);
    }
}

void sumByAccumulate(benchmark::State& state) {
    const std::vector<unsigned char> file = sampleBytes();
    const std::vector<unsigned char> device = sampleBytes();
    for (auto _ : state) {
        benchmark::DoNotOptimize(std::accumulate(file.begin(), file.end(), 0U));
        benchmark::DoNotOptimize(std::accumulate(device.begin(), device.end(), 0U));
    }
}

#if defined(__x86_64__)
typedef long long Quad __attribute__((vector_size(32)));
typedef char Bytes __attribute__((vector_size(32)));

__attribute__((target("avx2"))) std::uint64_t vectorSum(const unsigned char* bytes) {
    Quad sums[4] = {};
    for (std::size_t i = 0; i < rowBytes; i += 128) {
        for (std::size_t k = 0; k < 4; ++k) {
            Bytes block;
            __builtin_memcpy(&block, bytes + i + 32 * k, sizeof block);
            sums[k] += reinterpret_cast<Quad>(__builtin_ia32_psadbw256(block, Bytes{}));
        }
    }
    const Quad sum = sums[0] + sums[1] + sums[2] + sums[3];
    return static_cast<std::uint64_t>(sum[0] + sum[1] + sum[2] + sum[3]);
}

void sumByVector(benchmark::State& state) {
    if (__builtin_cpu_supports("avx2") == 0) {
        state.SkipWithError("no 32-byte vectors");
    }
    const std::vector<unsigned char> file = sampleBytes();
    const std::vector<unsigned char> device = sampleBytes();
    for (auto _ : state) {
        benchmark::DoNotOptimize(vectorSum(file.data()));
        benchmark::DoNotOptimize(vectorSum(device.data()));
    }
}
#define TESSAL_VECTOR_SUM \
    { "vector byte sum", sumByVector }
#else
#define TESSAL_VECTOR_SUM \
    {}
#endif

void lastRow(benchmark::State& state, int totalBits) {
    HkMessageManager::setHandler(ignoreMessage, nullptr);
    RLBitVec row(8, true);
    for (auto _ : state) {
        int fileSum = 0;
        int deviceSum = 0;
        const std::unique_ptr<char[]> text(
            PromUtility::rowChecksum(0, &row, 8, &row, 8, true, fileSum, deviceSum, 0, totalBits));
        benchmark::DoNotOptimize(text.get());
    }
    HkMessageManager::setHandler(nullptr, nullptr);
}

void fillFar(benchmark::State& state) {
    lastRow(state, 1 << 30);
}

void fillNothing(benchmark::State& state) {
    lastRow(state, 8);
}

const RegisterItem sumItem{
    {"checksum_rows", {"PromUtility", sumOurs}, {{"std::accumulate", sumByAccumulate}}, TESSAL_VECTOR_SUM, 0.35, 1.30}};
const RegisterItem fillItem{
    {"checksum_fill", {"PromUtility, 128 MiB to fill", fillFar}, {}, {"nothing to fill", fillNothing}, 0, 1.30}};

}  // namespace
