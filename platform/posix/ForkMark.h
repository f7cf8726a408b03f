// Tells a process from the children forked from it, at the price of reading one word.
//
// The word lies in a page that the kernel zeroes in every child, so even a child made by a bare clone call is noticed;
// where the kernel cannot do that, a fork handler zeroes it.
#pragma once

#include <atomic>
#include <cstdint>

namespace ForkMark {

/// While it lives, no thread of this process forks: what is attached and marked as not to be inherited between, no
/// child can see half done. Do not nest, and do not block inside.
class ForkPause {
public:
    ForkPause();
    ~ForkPause();
    ForkPause(const ForkPause&) = delete;
    ForkPause& operator=(const ForkPause&) = delete;
};

/// The mark of the calling process; no process has the mark of an ancestor. Call it under a ForkPause.
std::uint64_t own();

extern std::atomic<std::atomic<std::uint64_t>*> word;

/// True in the process that got @p mark from own(), false in every child of it.
inline bool isOwn(std::uint64_t mark) {
    return word.load(std::memory_order_relaxed)->load(std::memory_order_relaxed) == mark;
}

}  // namespace ForkMark
