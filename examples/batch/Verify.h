// The checks of a PROM by the sums of its rows.
#pragma once

#include <optional>

#include "Chain.h"
#include "DataFile.h"

/// Compares a PROM with its image, row by row, and has the library tell the verdict; a difference also with its place.
/// What the image leaves open of the PROM counts as erased.
bool verifyProm(const Prom& prom, const Bytes& image);

/// Sums all of a PROM, and has the library tell how it compares.
bool sumProm(const Prom& prom, std::optional<unsigned int> expected);
