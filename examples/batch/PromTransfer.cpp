#include "PromTransfer.h"

#include <algorithm>
#include <cstdio>

#include "ByteProgress.h"
#include "Interruption.h"

namespace {

/// Blocks up to the end or the first problem; how many bytes were done.
int transfer(const char* title, int length, const BlockStep& step, std::string& problem) {
    ByteProgress progress(title, static_cast<std::uint64_t>(length));
    int done = 0;
    while (done < length && problem.empty()) {
        const int count = std::min(longestBlock, length - done);
        problem = Interruption::isWanted() ? "interrupted" : step(done, count);
        if (problem.empty()) {
            done += count;
            progress.add(static_cast<std::uint64_t>(count));
        }
    }
    return done;
}

}  // namespace

bool forEachBlock(const Prom& prom, const char* title, int length, const BlockStep& step) {
    std::string problem;
    const int done = transfer(title, length, step, problem);
    return problem.empty() || prom.fail(std::string(title) + " ended at byte " + std::to_string(done) + " of " +
                                        std::to_string(length) + ": " + problem);
}

bool readBlocks(const Prom& prom, const char* title, int length, const ReadStep& step) {
    Bytes block(longestBlock);
    return forEachBlock(prom, title, length, [&](int offset, int count) {
        return prom.device.read(prom.position, offset, block.data(), count) ? step(offset, block.data(), count)
                                                                            : prom.device.failure();
    });
}

bool eraseProm(const Prom& prom) {
    if (!prom.device.erase(prom.position)) {
        return prom.fail("not erased: " + prom.device.failure());
    }
    std::printf("  position %d: erased\n", prom.position + 1);
    return true;
}

bool programProm(const Prom& prom, const Bytes& image) {
    return forEachBlock(prom, "programming", static_cast<int>(image.size()), [&](int offset, int count) {
        return prom.device.program(prom.position, offset, image.data() + offset, count) ? "" : prom.device.failure();
    });
}
