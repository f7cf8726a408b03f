// ELF files to be read, good and bad.
#pragma once

#include <cstdint>
#include <string>
#include <vector>

struct ElfImage {
    struct Entry {
        std::uint64_t type, offset, vaddr, paddr, filesz, memsz;
    };

    bool is64;
    bool mostFirst;
    std::vector<Entry> entries;
    std::string data;                  ///< behind the headers
    std::uint64_t count = 0;           ///< e_phnum where it is not that of the entries
    std::uint64_t entrySize = 0;       ///< e_phentsize where it is not the right one
    std::uint64_t sectionsOffset = 0;  ///< e_shoff

    /// Two segments, 4 bytes at 0x1000 and 2 at 0x1010: 122 bytes.
    static ElfImage small() {
        return {false,
                false,
                {{1, 0x74, 0x1000, 0x1000, 4, 4}, {1, 0x78, 0x20000000, 0x1010, 2, 8}},
                "\x01\x02\x03\x04\xAA\xBB"};
    }
    /// One segment of 64 bits, most significant byte first: 2 bytes at 0x80000000, 122 bytes too.
    static ElfImage large() { return {true, true, {{1, 0x78, 0x80000000, 0x80000000, 2, 2}}, "\x12\x34"}; }

    std::string text() const {
        const unsigned word = is64 ? 8 : 4;
        const std::uint64_t headerSize = is64 ? 0x40 : 0x34;
        const std::uint64_t usualEntrySize = is64 ? 0x38 : 0x20;
        std::string out = "\177ELF";
        put(out, 1, {word / 4, mostFirst ? 2U : 1U, 1, 0, 0, 0, 0, 0, 0, 0, 0, 0});
        put(out, 2, {2, 0});
        put(out, 4, {1});
        put(out, word, {0, headerSize, sectionsOffset});
        put(out, 4, {0});
        put(out, 2, {headerSize, entrySize != 0 ? entrySize : usualEntrySize, count != 0 ? count : entries.size()});
        put(out, 2, {0, 0, 0});
        for (const Entry& e : entries) {
            put(out, word, {mostFirst ? e.type << (8 * word - 32) : e.type});  // with the flags of 64 bits
            put(out, word, {e.offset, e.vaddr, e.paddr, e.filesz, e.memsz});
            put(out, 4, {0, 0});
        }
        return out + data;
    }

private:
    void put(std::string& out, unsigned width, std::initializer_list<std::uint64_t> values) const {
        for (const std::uint64_t value : values) {
            for (unsigned i = 0; i < width; ++i) {
                out += static_cast<char>(value >> 8 * (mostFirst ? width - 1 - i : i) & 0xFF);
            }
        }
    }
};
