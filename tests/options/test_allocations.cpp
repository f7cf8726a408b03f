// Setters and readers work on the tables in place: counted by a replaced operator new.

#include <gtest/gtest.h>

#include <cstdlib>
#include <new>

#include "DeviceOptionsMgr.h"

namespace {

std::size_t allocations = 0;

}  // namespace

// Not inlined: the compiler would see malloc's memory go to delete and warn.
[[gnu::noinline]] void* operator new(std::size_t size) {
    ++allocations;
    if (void* const memory = std::malloc(size)) {
        return memory;
    }
    throw std::bad_alloc();
}

[[gnu::noinline]] void operator delete(void* memory) noexcept {
    std::free(memory);
}

[[gnu::noinline]] void operator delete(void* memory, std::size_t) noexcept {
    std::free(memory);
}

namespace {

TEST(OptionAllocations, SettersAllocateNothingButTheText) {
    DeviceOptionsMgr manager;
    const HkString text("a text that is longer than any small buffer could hold without an allocation");
    allocations = 0;
    for (int i = 0; i < manager.getNumberOptions(); ++i) {
        manager.setOption(static_cast<tESSALNS::PROGRAM_OPTION>(i), true);
        manager.setOption(static_cast<tESSALNS::PROGRAM_OPTION>(i), text);
    }
    EXPECT_EQ(allocations, 0U) << "switches, and texts that are shared";
    manager.setOption(tESSALNS::USERCODE, text.c_str());
    EXPECT_EQ(allocations, 1U);
    allocations = 0;
    EXPECT_EQ(manager.getVerifyOptions().size(), 8U);
    EXPECT_LT(allocations, 50U) << "the result grows; the 105 descriptions are not copied";
}

}  // namespace
