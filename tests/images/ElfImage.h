// ELF files to be read, good and bad.
#pragma once

#include <cstdint>
#include <string>
#include <vector>

class ElfImage {
public:
    struct Entry {
        std::uint64_t type, offset, vaddr, paddr, filesz, memsz;
    };

    bool is64 = false;
    bool mostFirst = false;
    std::vector<Entry> entries;
    std::string data;                  ///< behind the headers
    std::uint64_t count = 0;           ///< e_phnum where it is not that of the entries
    std::uint64_t entrySize = 0;       ///< e_phentsize where it is not the right one
    std::uint64_t sectionsOffset = 0;  ///< e_shoff

    std::string text() const {
        std::string out =
            "\x7F"
            "ELF";
        const unsigned word = is64 ? 8 : 4;
        const std::uint64_t headerSize = is64 ? 0x40 : 0x34;
        const std::uint64_t usualEntrySize = is64 ? 0x38 : 0x20;
        const struct {
            std::uint64_t value;
            unsigned width;
        } fields[] = {{word / 4, 1},
                      {mostFirst ? 2U : 1U, 1},
                      {1, 1},
                      {0, 9},
                      {2, 2},
                      {0, 2},
                      {1, 4},
                      {0, word},
                      {headerSize, word},
                      {sectionsOffset, word},
                      {0, 4},
                      {headerSize, 2},
                      {entrySize != 0 ? entrySize : usualEntrySize, 2},
                      {count != 0 ? count : entries.size(), 2},
                      {0, 6}};
        for (const auto& field : fields) {
            put(out, field.value, field.width);
        }
        for (const Entry& e : entries) {
            put(out, e.type, 4);
            put(out, 0, is64 ? 4 : 0);
            for (const std::uint64_t value : {e.offset, e.vaddr, e.paddr, e.filesz, e.memsz}) {
                put(out, value, word);
            }
            put(out, 0, 8);
        }
        return out + data;
    }

    /// Two segments, 4 bytes at 0x1000 and 2 at 0x1010: 122 bytes.
    static ElfImage small() {
        ElfImage elf;
        elf.entries = {{1, 0x74, 0x1000, 0x1000, 4, 4}, {1, 0x78, 0x20000000, 0x1010, 2, 8}};
        elf.data = "\x01\x02\x03\x04\xAA\xBB";
        return elf;
    }
    /// One segment of 64 bits, most significant byte first: 2 bytes at 0x80000000.
    static ElfImage large() {
        ElfImage elf;
        elf.is64 = elf.mostFirst = true;
        elf.entries = {{1, 0x78, 0x80000000, 0x80000000, 2, 2}};
        elf.data = "\x12\x34";
        return elf;
    }

private:
    void put(std::string& out, std::uint64_t value, unsigned width) const {
        for (unsigned i = 0; i < width; ++i) {
            const unsigned place = mostFirst ? width - 1 - i : i;
            out += static_cast<char>(place < 8 ? value >> (8 * place) & 0xFF : 0);
        }
    }
};
