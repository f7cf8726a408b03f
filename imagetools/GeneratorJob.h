// What one run of the generator has to do, as its arguments tell.
#pragma once

#include <cstdint>
#include <optional>
#include <string>
#include <vector>

#include "HkCmdArgs.h"
#include "imagetools/PromFormat.h"
#include "imagetools/Texts.h"

namespace ImageTools {

struct DataFile {
    std::string path;
    bool goesDown = false;
    std::optional<std::uint64_t> address;  ///< of its first byte; otherwise it goes on from the file before
};

struct Prom {
    std::string name;
    std::uint64_t size = 0;
};

struct GeneratorJob {
    std::vector<DataFile> files;
    std::vector<Prom> proms;  ///< in the order of their addresses
    bool isGeneric = false;   ///< one PROM as large as the data
    const PromFormat* format = nullptr;
    std::string output;  ///< path of the files without number and extension
    std::string title;
    unsigned char fill = 0xFF;
    bool fillsGaps = false;
    bool leavesFillOut = false;
    bool mirrorsBits = true;
    bool alignsFiles = false;  ///< each file begins at the next border of 64 KiB

    std::uint64_t capacity() const;
    /// Path of the file of a PROM, numbered where there are several.
    std::string outputOf(std::size_t prom) const;
};

/// The format of the generator's arguments.
extern const char* const generatorFormat;

/// Fills the job from arguments that fit the format.
Problem readJob(const HkCmdArgs& args, GeneratorJob& job);

}  // namespace ImageTools
