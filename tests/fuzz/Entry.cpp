// Where the fuzzing engine enters each target; messages are not shown.
#include <cstdint>

#include "HkMessageManager.h"
#include "fuzz/Fuzz.h"

extern "C" int LLVMFuzzerTestOneInput(const std::uint8_t* data, std::size_t size) {
    HkMessageManager::setHandler([](const HkMessage&, void*) {}, nullptr);
    fuzz(Input({reinterpret_cast<const char*>(data), size}));
    return 0;
}
