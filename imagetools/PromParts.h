// Sizes of PROMs, from the catalogue or as written on a command line.
#pragma once

#include <cstdint>
#include <optional>

#include "imagetools/Texts.h"

namespace ImageTools {

/// The bytes of a part, named in any case: the first of its name in "proms.acd", "tessal.acd" and "proms.dat".
/// @param size set where there is no problem
Problem findPartSize(const char* part, std::uint64_t& size);

/// A number of bytes from 1 to 4 GiB: decimal, or hexadecimal with 0x, with K, M or G behind it or without. None where
/// it is no such number.
std::optional<std::uint64_t> parseSize(const char* text);

}  // namespace ImageTools
