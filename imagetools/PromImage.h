// The image of all PROMs together: the data files at their addresses.
#pragma once

#include <memory>
#include <vector>

#include "imagetools/GeneratorJob.h"
#include "imagetools/ObjectFile.h"

namespace ImageTools {

class PromImage {
public:
    /// Reads the job's data files and places them. What is wrong with a file's content is reported at once.
    Problem load(const GeneratorJob& job);

    const SegmentMap& segments() const { return m_segments; }

private:
    Problem place(const GeneratorJob& job, const DataFile& file, LoadedFile& loaded);
    Problem addUp(const DataFile& file, const LoadedFile& loaded, std::uint64_t address, std::uint64_t capacity);
    Problem addDown(const DataFile& file, LoadedFile& loaded, std::uint64_t end, std::uint64_t capacity);
    Problem addSegment(const DataFile& file, const Segment& segment);

    std::vector<std::unique_ptr<LoadedFile>> m_files;  // what the segments point into
    SegmentMap m_segments;
    std::uint64_t m_next = 0;  ///< where the next file goes on: from here up, or below it
};

}  // namespace ImageTools
