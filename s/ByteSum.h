// The arithmetic sum of bytes.
#pragma once

#include <cstddef>
#include <cstdint>

/// The sum of the bytes, modulo 2^64.
std::uint64_t sumBytes(const unsigned char* bytes, std::size_t count);

/// The same without vector instructions of the processor; for hosts that have none, and for tests.
std::uint64_t sumBytesPortably(const unsigned char* bytes, std::size_t count);
