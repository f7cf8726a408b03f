#include "imagetools/ElfReader.h"

#include <cstring>
#include <vector>

namespace ImageTools {
namespace {

constexpr std::uint64_t loadable = 1;             // p_type of what is loaded
constexpr std::uint64_t countElsewhere = 0xFFFF;  // e_phnum of a count that stands in section header 0

/// Where the fields stand in files of one class.
struct Layout {
    unsigned wordSize;  ///< width of addresses, offsets and sizes
    std::uint64_t headerSize;
    // In the file's header.
    std::uint64_t headersOffset, sectionsOffset, entrySizeOffset, countOffset;
    // In a program header, and the width of one.
    std::uint64_t fileOffset, virtualAddress, loadAddress, fileSize, memorySize, entrySize;
    // In a section header, and the width of one.
    std::uint64_t sectionInfo, sectionSize;
};

constexpr Layout layout32{4, 0x34, 0x1C, 0x20, 0x2A, 0x2C, 0x4, 0x8, 0xC, 0x10, 0x14, 0x20, 0x1C, 0x28};
constexpr Layout layout64{8, 0x40, 0x20, 0x28, 0x36, 0x38, 0x8, 0x10, 0x18, 0x20, 0x28, 0x38, 0x2C, 0x40};

struct Entry {
    std::uint64_t number, offset, virtualAddress, loadAddress, fileSize, memorySize;

    std::string name() const { return "program header " + std::to_string(number); }
};

class Reader {
public:
    Reader(const ByteSource& file, const Layout& layout, ByteOrder order)
        : m_file(file), m_layout(layout), m_order(order) {}

    Problem read(SegmentMap& segments, std::string& note) {
        if (!m_file.holds(0, m_layout.headerSize)) {
            return "the ELF header needs " + std::to_string(m_layout.headerSize) + " bytes, the file has " +
                   std::to_string(m_file.size());
        }
        std::uint64_t count = half(m_layout.countOffset);
        if (Problem problem = resolveCount(count); !problem.empty()) {
            return problem;
        }
        if (Problem problem = readEntries(count); !problem.empty()) {
            return problem;
        }
        if (mustUseVirtualAddresses()) {
            note = "all load addresses are 0, the virtual addresses are used instead";
            for (Entry& entry : m_entries) {
                entry.loadAddress = entry.virtualAddress;
            }
        }
        return addEntries(segments);
    }

private:
    std::uint64_t half(std::uint64_t offset) const { return m_file.number(offset, 2, m_order); }
    std::uint64_t word(std::uint64_t offset) const { return m_file.number(offset, m_layout.wordSize, m_order); }

    Problem resolveCount(std::uint64_t& count) const {
        if (count == countElsewhere) {
            const std::uint64_t section = word(m_layout.sectionsOffset);
            if (section == 0 || !m_file.holds(section, m_layout.sectionSize)) {
                return "the number of program headers should stand in section header 0, which lies at " +
                       hexText(section) + " outside the file";
            }
            count = m_file.number(section + m_layout.sectionInfo, 4, m_order);
        }
        return count != 0 ? Problem() : "no program headers; link it first";
    }

    Problem readEntries(std::uint64_t count) {
        const std::uint64_t size = half(m_layout.entrySizeOffset);
        if (size != m_layout.entrySize) {
            return "a program header has " + std::to_string(m_layout.entrySize) + " bytes, the file says " +
                   std::to_string(size);
        }
        const std::uint64_t first = word(m_layout.headersOffset);
        if (!m_file.holds(first, count * size)) {
            return std::to_string(count) + " program headers at " + hexText(first) + " go past the end of the file, " +
                   countText(m_file.size(), "byte");
        }
        for (std::uint64_t i = 0; i < count; ++i) {
            const std::uint64_t at = first + i * size;
            const Entry entry{i,
                              word(at + m_layout.fileOffset),
                              word(at + m_layout.virtualAddress),
                              word(at + m_layout.loadAddress),
                              word(at + m_layout.fileSize),
                              word(at + m_layout.memorySize)};
            if (m_file.number(at, 4, m_order) == loadable && entry.fileSize != 0) {
                if (Problem problem = check(entry); !problem.empty()) {
                    return problem;
                }
                m_entries.push_back(entry);
            }
        }
        return {};
    }

    Problem check(const Entry& entry) const {
        if (!m_file.holds(entry.offset, entry.fileSize)) {
            return entry.name() + ": " + hexText(entry.fileSize) + " bytes at offset " + hexText(entry.offset) +
                   " go past the end of the file, " + countText(m_file.size(), "byte");
        }
        if (entry.fileSize > entry.memorySize) {
            return entry.name() + ": " + hexText(entry.fileSize) + " bytes in the file, only " +
                   hexText(entry.memorySize) + " in memory";
        }
        return {};
    }

    /// Programs for hosted systems leave the load addresses open.
    bool mustUseVirtualAddresses() const {
        bool someVirtual = false;
        for (const Entry& entry : m_entries) {
            if (entry.loadAddress != 0) {
                return false;
            }
            someVirtual = someVirtual || entry.virtualAddress != 0;
        }
        return someVirtual;
    }

    Problem addEntries(SegmentMap& segments) const {
        for (const Entry& entry : m_entries) {
            const std::uint64_t address = entry.loadAddress;
            if (address >= addressSpace || entry.fileSize > addressSpace - address) {
                return entry.name() + ": " + hexText(entry.fileSize) + " bytes at address " + hexText(address) +
                       " go past the last address, " + hexText(addressSpace - 1);
            }
            if (const Segment* const other = segments.overlap(address, entry.fileSize)) {
                return entry.name() + ": " + rangeText(address, address + entry.fileSize) +
                       " overlaps the segment at " + rangeText(other->address, other->end());
            }
            segments.add({address, m_file.at(entry.offset), static_cast<std::size_t>(entry.fileSize)});
        }
        return {};
    }

    const ByteSource& m_file;
    const Layout& m_layout;
    ByteOrder m_order;
    std::vector<Entry> m_entries;
};

}  // namespace

Problem readElf(const ByteSource& file, SegmentMap& segments, std::string& note) {
    constexpr std::uint64_t identificationSize = 16;
    if (!file.holds(0, identificationSize) || std::memcmp(file.at(0),
                                                          "\x7F"
                                                          "ELF",
                                                          4) != 0) {
        return "not an ELF file: it does not begin with 7F 45 4C 46";
    }
    const unsigned fileClass = *file.at(4);
    const unsigned encoding = *file.at(5);
    const unsigned version = *file.at(6);
    if (fileClass != 1 && fileClass != 2) {
        return "unknown ELF class " + std::to_string(fileClass) + ", expected 1 (32 bits) or 2 (64 bits)";
    }
    if (encoding != 1 && encoding != 2) {
        return "unknown byte order " + std::to_string(encoding) +
               ", expected 1 (least significant first) or 2 (most significant first)";
    }
    if (version != 1) {
        return "unknown ELF version " + std::to_string(version) + ", expected 1";
    }
    const ByteOrder order = encoding == 1 ? ByteOrder::LeastFirst : ByteOrder::MostFirst;
    return Reader(file, fileClass == 1 ? layout32 : layout64, order).read(segments, note);
}

}  // namespace ImageTools
