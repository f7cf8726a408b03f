// The row checksum of PromUtility.

#include <algorithm>
#include <cassert>
#include <cstdint>

#include "HkEnv.h"
#include "HkFile.h"
#include "HkStr.h"
#include "HkStream.h"
#include "PromUtility.h"
#include "s/BitKernels.h"
#include "s/BitVecAccess.h"
#include "s/ByteSum.h"
#include "s/PromUtilityOrigin.h"

namespace {

constexpr int byteBits = 8;

bool isDumped() {
    return HkEnv::GetEnv("ZRX_TESSAL_ZQ7300DUMPCHECKSUMDATA") != nullptr;
}

/// 32-bit addition that wraps.
void add(int& sum, std::uint64_t amount) {
    sum = static_cast<int>(static_cast<std::uint32_t>(sum) + static_cast<std::uint32_t>(amount));
}

/// The bits of the row that can be read: a caller's count may not pass the vector's length.
std::size_t readableBits(const RLBitVec* row, int bits) {
    if (bits < 1 || row == nullptr) {
        return 0;
    }
    assert(bits % byteBits == 0 && static_cast<std::size_t>(bits) <= row->length());
    return std::min(static_cast<std::size_t>(bits), row->length());
}

/// Adds the row bit by bit from its highest index down, in any numbering, and calls watch(index) behind each bit with
/// the index of the next one.
template <class Watch>
void addSingly(const RLBitVec& row, std::size_t bits, int& sum, Watch watch) {
    unsigned int weight = 1;
    for (std::size_t index = bits; index-- > 0;) {
        add(sum, row.testBit(index) ? weight : 0);
        weight = weight < 128 ? weight * 2 : 1;
        watch(static_cast<int>(index) - 1);
    }
}

/// Adds the row, whose bits lie in storage from position length - bits up.
void addRow(const RLBitVec& row, std::size_t bits, int& sum) {
    const std::size_t first = row.length() - bits;
    if (!BitVecAccess::hasUsualNumbering(row) || first % byteBits != 0) {
        addSingly(row, bits, sum, [](int) {});
        return;
    }
    const unsigned char* const bytes = row.data() + first / byteBits;
    add(sum, sumBytes(bytes, bits / byteBits));
    add(sum, BitKernels::readBits(bytes, bits - bits % byteBits, bits % byteBits));
}

void addDumpedRow(const RLBitVec& row, std::size_t bits, int& sum) {
    addSingly(row, bits, sum, [&sum](int next) {
        promUtilityOrigin.report().issueStatus("File Checksum is %x, i is %d\n", static_cast<unsigned int>(sum), next);
    });
}

void dumpFill(std::int64_t size, int fileChecksum, int deviceChecksum) {
    HkFile::getCout() << "Current Size " << static_cast<int>(size) << "File Checksum is " << fileChecksum
                      << "Device Checksum is " << deviceChecksum << HkStream::endl;
}

/// Counts every byte from @p size up to the end of the PROM as 0xFF.
void addFill(std::int64_t size, std::int64_t totalBits, bool dumped, int& fileChecksum, int& deviceChecksum) {
    constexpr std::uint64_t erased = 0xFF;
    if (size >= totalBits) {
        return;
    }
    std::int64_t count = (totalBits - size + byteBits - 1) / byteBits;
    for (; dumped && count > 0; --count, size += byteBits) {
        dumpFill(size, fileChecksum, deviceChecksum);
        add(fileChecksum, erased);
        add(deviceChecksum, erased);
    }
    add(fileChecksum, erased * static_cast<std::uint64_t>(count));
    add(deviceChecksum, erased * static_cast<std::uint64_t>(count));
}

/// A new text of "0" and eight digits.
std::unique_ptr<char[]> checksumText(int sum) {
    std::unique_ptr<char[]> text(new char[10]);
    HkStr::SPrintf(text.get(), "0%08x", static_cast<unsigned int>(sum));
    return text;
}

void reportVerdict(int fileChecksum, int deviceChecksum, const char* deviceText) {
    if (fileChecksum == 0) {
        promUtilityOrigin.report().issueStatus("Device checksum is  %s\n", deviceText);
    } else if (fileChecksum == deviceChecksum) {
        promUtilityOrigin.report().issueStatus("Calculated checksum matches expected checksum, %s\n",
                                               checksumText(fileChecksum).get());
    } else {
        promUtilityOrigin.report().issueError(
            "The calculated checksum (0x%08x) differs from the expected checksum (0x%08x).\n",
            static_cast<unsigned int>(deviceChecksum), static_cast<unsigned int>(fileChecksum));
    }
}

}  // namespace

char* PromUtility::rowChecksum(int, RLBitVec* fileRow, int fileBits, RLBitVec* deviceRow, int deviceBits, bool lastRow,
                               int& fileChecksum, int& deviceChecksum, int bitsDone, int totalBits) {
    const bool dumped = isDumped();
    if (const std::size_t bits = readableBits(deviceRow, deviceBits)) {
        addRow(*deviceRow, bits, deviceChecksum);
    }
    if (const std::size_t bits = readableBits(fileRow, fileBits)) {
        (dumped ? addDumpedRow : addRow)(*fileRow, bits, fileChecksum);
    }
    if (!lastRow) {
        return nullptr;
    }
    addFill(std::int64_t{bitsDone} + fileBits, totalBits, dumped, fileChecksum, deviceChecksum);
    std::unique_ptr<char[]> deviceText = checksumText(deviceChecksum);
    reportVerdict(fileChecksum, deviceChecksum, deviceText.get());
    return deviceText.release();
}
