// The bytes of a file with numbers in them, read within bounds.
#pragma once

#include <cassert>
#include <cstddef>
#include <cstdint>

namespace ImageTools {

enum class ByteOrder { LeastFirst, MostFirst };

class ByteSource {
public:
    ByteSource(const unsigned char* data, std::size_t size) : m_data(data), m_size(size) {}

    std::size_t size() const { return m_size; }
    const unsigned char* at(std::uint64_t offset) const { return m_data + offset; }

    /// Whether that many bytes stand there, whatever numbers a file claims.
    bool holds(std::uint64_t offset, std::uint64_t count) const { return count <= m_size && offset <= m_size - count; }

    /// The number of @p width bytes, which stand there.
    std::uint64_t number(std::uint64_t offset, unsigned width, ByteOrder order) const {
        assert(holds(offset, width));
        std::uint64_t value = 0;
        for (unsigned i = 0; i < width; ++i) {
            const unsigned place = order == ByteOrder::MostFirst ? i : width - 1 - i;
            value = value << 8 | m_data[offset + place];
        }
        return value;
    }

private:
    const unsigned char* m_data;
    std::size_t m_size;
};

}  // namespace ImageTools
