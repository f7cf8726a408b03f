#include "platform/posix/ForkMark.h"

#include <pthread.h>
#include <sys/mman.h>

#include <mutex>
#include <new>

namespace ForkMark {
namespace {

std::atomic<std::uint64_t> plainWord{0};

/// Counts the marks given in this process and, as fork copies it, in its ancestors: so no mark comes twice in a line.
std::uint64_t marksGiven = 0;

std::mutex gate;  // constant-initialised and trivially destroyed: usable before main and behind it

std::atomic<std::uint64_t>& makeWord() {
    void* const page = ::mmap(nullptr, sizeof plainWord, PROT_READ | PROT_WRITE, MAP_PRIVATE | MAP_ANONYMOUS, -1, 0);
    if (page != MAP_FAILED) {
        ::madvise(page, sizeof plainWord, MADV_WIPEONFORK);
        word.store(new (page) std::atomic<std::uint64_t>{0}, std::memory_order_relaxed);
    }
    return *word.load(std::memory_order_relaxed);
}

void leaveInChild() {
    word.load(std::memory_order_relaxed)->store(0, std::memory_order_relaxed);
    gate.unlock();
}

// Where memory is too short for the handlers, the wiped page still tells the child.
[[maybe_unused]] const int registered = ::pthread_atfork([] { gate.lock(); }, [] { gate.unlock(); }, &leaveInChild);

}  // namespace

std::atomic<std::atomic<std::uint64_t>*> word{&plainWord};

ForkPause::ForkPause() {
    gate.lock();
}

ForkPause::~ForkPause() {
    gate.unlock();
}

std::uint64_t own() {
    static std::atomic<std::uint64_t>& mark = makeWord();
    if (mark.load(std::memory_order_relaxed) == 0) {
        mark.store(++marksGiven, std::memory_order_relaxed);
    }
    return mark.load(std::memory_order_relaxed);
}

}  // namespace ForkMark
