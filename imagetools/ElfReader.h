// The loaded parts of an ELF file.
#pragma once

#include "imagetools/ByteSource.h"
#include "imagetools/SegmentMap.h"
#include "imagetools/Texts.h"

namespace ImageTools {

/// Reads the program headers of a 32- or 64-bit file of either byte order. A segment is what a PT_LOAD entry keeps in
/// the file, at its load address; memory that is only cleared at start is no part of it. The segments point into the
/// source.
/// @param note gets a remark on a file that was read in a way that may surprise
Problem readElf(const ByteSource& file, SegmentMap& segments, std::string& note);

}  // namespace ImageTools
