// Memory-initialisation text: "@address" and words in hexadecimal.
#pragma once

#include <string>
#include <string_view>
#include <vector>

#include "imagetools/SegmentMap.h"

namespace ImageTools {

struct MemOptions {
    bool leastSignificantFirst = false;  ///< a word's rightmost digits go to the lowest address
    bool byteAddresses = false;          ///< "@" counts bytes, whatever the width of a word
    bool fillsUnknown = false;           ///< unknown bits, `x` and `z` digits, read as ones; otherwise an error
};

/// Reads the text. The bytes go to @p bytes, which holds half as many bytes as the text has characters; the segments
/// point into it.
/// @return the problems, "line:column: text" each, at most 20; with any of them the segments are worthless
std::vector<std::string> readMem(std::string_view text, const MemOptions& options, unsigned char* bytes,
                                 SegmentMap& segments);

}  // namespace ImageTools
