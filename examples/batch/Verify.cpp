#include "Verify.h"

#include <algorithm>
#include <cstdio>

#include "PromTransfer.h"

namespace {

/// A row is a block of the transfer.
RLBitVec rowOf(const unsigned char* bytes, int length) {
    return {bytes, static_cast<std::size_t>(length) * 8};
}

/// The running sums of a check.
struct Sums {
    int file = 0;
    int device = 0;

    void add(RLBitVec* fileRow, RLBitVec* deviceRow, int length) {
        const int bits = length * 8;
        PromUtility::rowChecksum(0, fileRow, fileRow != nullptr ? bits : 0, deviceRow, bits, false, file, device, 0, 0);
    }

    /// Counts what is behind the bytes that were added as erased, and has the library tell the verdict.
    std::string conclude(int bytes, int promSize) {
        const std::unique_ptr<char[]> text(
            PromUtility::rowChecksum(0, nullptr, 0, nullptr, 0, true, file, device, bytes * 8, promSize * 8));
        return text.get();
    }
};

std::string differenceText(const Bytes& image, int place, int deviceByte) {
    char text[80];
    std::snprintf(text, sizeof text, "byte 0x%X is the first that differs: %02X in the file, %02X in the device",
                  static_cast<unsigned int>(place), static_cast<unsigned int>(image[static_cast<std::size_t>(place)]),
                  static_cast<unsigned int>(deviceByte));
    return text;
}

}  // namespace

bool verifyProm(const Prom& prom, const Bytes& image) {
    const int size = static_cast<int>(image.size());
    Sums sums;
    int difference = -1;
    int deviceByte = 0;
    const auto addRow = [&](int offset, const unsigned char* block, int length) -> std::string {
        const unsigned char* const wanted = image.data() + offset;
        RLBitVec fileRow = rowOf(wanted, length);
        RLBitVec deviceRow = rowOf(block, length);
        sums.add(&fileRow, &deviceRow, length);
        const auto place = std::mismatch(wanted, wanted + length, block);
        if (difference < 0 && place.first != wanted + length) {
            difference = static_cast<int>(place.first - image.data());
            deviceByte = *place.second;
        }
        return "";
    };
    if (!readBlocks(prom, "verifying", size, addRow)) {
        return false;
    }
    const std::string deviceSum = sums.conclude(size, prom.size);
    std::printf("  device checksum %s\n", deviceSum.c_str());
    return difference < 0 || prom.fail(differenceText(image, difference, deviceByte));
}

bool sumProm(const Prom& prom, std::optional<unsigned int> expected) {
    Sums sums;
    sums.file = static_cast<int>(expected.value_or(0));
    const auto addRow = [&](int, const unsigned char* block, int length) -> std::string {
        RLBitVec row = rowOf(block, length);
        sums.add(nullptr, &row, length);
        return "";
    };
    if (!readBlocks(prom, "checksum", prom.size, addRow)) {
        return false;
    }
    sums.conclude(prom.size, prom.size);
    return !expected || *expected == static_cast<unsigned int>(sums.device);
}
