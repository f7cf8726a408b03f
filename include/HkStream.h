/// @file
/// The console output stream.
#pragma once

#include "TessalExport.h"

namespace HostKit {

/// Writes to standard output. There is one, HkFile::getCout(), which lives as long as the process.
class TESSAL_API HkStream {
public:
    HkStream(const HkStream&) = delete;
    HkStream& operator=(const HkStream&) = delete;

    /// Writes the text, with no line end added; null writes nothing.
    HkStream& operator<<(const char* text);
    /// Writes the number in decimal.
    HkStream& operator<<(int number);
    /// Calls the function on the stream.
    HkStream& operator<<(HkStream& (*manipulator)(HkStream&));

    /// Writes a line end.
    static HkStream& endl(HkStream& stream);

    /// The one stream of the process.
    static HkStream& console();

private:
    HkStream() = default;
};

}  // namespace HostKit

using HostKit::HkStream;
