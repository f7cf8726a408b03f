/// @file
/// Bit vectors as text for people: grouped bits, hex dumps, differences.
#pragma once

#include <cstddef>
#include <string>

#include "RLBitVec.h"
#include "TessalExport.h"

/// The bits from index 0 on, in groups counted from index 0: `1010_0101_11`. A group of 0 bits means no groups.
TESSAL_API std::string toGroupedText(const LRBitVec& vector, std::size_t group = 4, char separator = '_');

/// The bits from index 0 on, as they read as a number, in groups counted from the right end: `11_1010_0101`.
TESSAL_API std::string toGroupedText(const RLBitVec& vector, std::size_t group = 4, char separator = '_');

/// The bytes that hold the length, 16 a line, each line begun with the storage position of its first bit. Bits behind
/// the length show as 0.
///
///            0  12 a5 00 00 00 00 00 00 00 00 00 00 00 00 00 00
///          128  0f
TESSAL_API std::string hexDump(const LRBitVec& vector);

/// Where two vectors differ: the number of differing bits, then each stretch of 64 storage positions with a difference,
/// its first position, the bits of both and marks below those that differ. A bit that one vector lacks shows as `-`
/// and counts as different. Equal vectors give the empty text.
///
///     2 of 10 bits differ
///            0  1010010111
///               1000010110
///                 ^      ^
TESSAL_API std::string difference(const LRBitVec& a, const LRBitVec& b);
