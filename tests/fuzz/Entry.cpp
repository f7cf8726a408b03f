// Where the fuzzing engine enters each target; messages are not shown.
#include "HkMessageManager.h"
#include "fuzz/Fuzz.h"

extern "C" int LLVMFuzzerTestOneInput(const std::uint8_t* data, std::size_t size) {
    HkMessageManager::setHandler([](const HkMessage&, void*) {}, nullptr);
    fuzz({data, size});
    return 0;
}
