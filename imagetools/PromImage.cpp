#include "imagetools/PromImage.h"

#include <algorithm>

#include "s/TextKernels.h"

namespace ImageTools {
namespace {

constexpr std::uint64_t imageBorder = 0x10000;  // of the images of a PROM, where no offsets are told

std::uint64_t roundedUp(std::uint64_t address) {
    return (address + imageBorder - 1) / imageBorder * imageBorder;
}

std::string pastTheEnd(const std::string& path, std::uint64_t first, std::uint64_t last, std::uint64_t capacity) {
    return path + ": the data would take " + rangeText(first, last) + ", the PROMs end at " + hexText(capacity - 1) +
           " (" + countText(capacity, "byte") + ')';
}

}  // namespace

Problem PromImage::load(const GeneratorJob& job) {
    for (const DataFile& file : job.files) {
        auto loaded = std::make_unique<LoadedFile>();
        if (loadFile(file.path.c_str(), kindOf(file.path.c_str()), {}, *loaded) != LoadResult::Done) {
            return "data file " + file.path + " cannot be used";
        }
        if (job.mirrorsBits) {
            textKernels().mirrorBytes(loaded->bytes(), loaded->backing.size, loaded->bytes());
        }
        if (Problem problem = place(job, file, *loaded); !problem.empty()) {
            return problem;
        }
        m_files.push_back(std::move(loaded));
    }
    return m_segments.isEmpty() ? "the data files hold no data" : Problem();
}

Problem PromImage::place(const GeneratorJob& job, const DataFile& file, LoadedFile& loaded) {
    if (job.alignsFiles) {
        m_next = roundedUp(m_next);
    }
    if (file.goesDown) {
        return addDown(file, loaded, file.address ? *file.address + 1 : m_next, job.capacity());
    }
    const bool keepsItsOwn = !file.address && !job.alignsFiles && kindOf(file.path.c_str()) != FileKind::Raw;
    return addUp(file, loaded, keepsItsOwn ? loaded.segments.lowest() : file.address.value_or(m_next), job.capacity());
}

Problem PromImage::addUp(const DataFile& file, const LoadedFile& loaded, std::uint64_t address,
                         std::uint64_t capacity) {
    m_next = address + loaded.segments.span();
    if (m_next > capacity) {
        return pastTheEnd(file.path, address, m_next, capacity);
    }
    Problem problem;
    for (const Segment& segment : loaded.segments.all()) {
        if (problem.empty()) {
            problem =
                addSegment(file, {segment.address - loaded.segments.lowest() + address, segment.data, segment.size});
        }
    }
    return problem;
}

/// The file's lowest byte goes directly below @p end and the others below it.
Problem PromImage::addDown(const DataFile& file, LoadedFile& loaded, std::uint64_t end, std::uint64_t capacity) {
    const std::uint64_t span = loaded.segments.span();
    if (span > end) {
        return file.path + ": " + countText(span, "byte") + " do not fit below " + hexText(end) + ", where " +
               countText(end, "byte") + " have room";
    }
    if (end > capacity) {
        return pastTheEnd(file.path, end - span, end, capacity);
    }
    m_next = end - span;
    const std::size_t total = loaded.backing.size;
    std::reverse(loaded.bytes(), loaded.bytes() + total);
    Problem problem;
    for (const Segment& segment : loaded.segments.all()) {
        const auto offset = static_cast<std::size_t>(segment.data - loaded.bytes());
        if (problem.empty()) {
            problem = addSegment(file, {end - (segment.end() - loaded.segments.lowest()),
                                        loaded.bytes() + (total - offset - segment.size), segment.size});
        }
    }
    return problem;
}

Problem PromImage::addSegment(const DataFile& file, const Segment& segment) {
    if (const Segment* const other = m_segments.overlap(segment.address, segment.size)) {
        return file.path + ": the data at " + rangeText(segment.address, segment.end()) +
               " overlaps what is already at " + rangeText(other->address, other->end());
    }
    m_segments.add(segment);
    return {};
}

}  // namespace ImageTools
