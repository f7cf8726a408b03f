// The memory of a simulated PROM.
#pragma once

#include <cstdint>
#include <string>
#include <vector>

/// The bytes of a PROM, kept in a file. An erased byte is 0xFF, and so is each behind the end of the file.
///
/// As in the real thing, programming only turns ones into zeros: without erasing first, old and new bytes mix.
class PromContent {
public:
    /// Takes what the file holds, up to the PROM's size; one that is not there is an erased PROM. Without a file,
    /// "", the content lasts as long as the object.
    PromContent(std::string file, int size);

    bool holds(int offset, int length) const { return offset >= 0 && length >= 0 && length <= m_size - offset; }

    // False where the file cannot be written. The block is one that the PROM holds.

    bool erase();
    bool program(int offset, const std::vector<unsigned char>& block);

    std::vector<unsigned char> read(int offset, int length) const;

private:
    bool store(std::size_t first, std::size_t last) const;

    std::string m_file;
    int m_size;
    std::vector<unsigned char> m_bytes;  ///< up to the last one that was programmed
};
