#include "PromContent.h"

#include <algorithm>
#include <filesystem>
#include <fstream>
#include <utility>

namespace {

constexpr unsigned char erased = 0xFF;

}  // namespace

PromContent::PromContent(std::string file, int size) : m_file(std::move(file)), m_size(size) {
    std::ifstream stored(std::filesystem::u8path(m_file), std::ios::binary);
    m_bytes.resize(static_cast<std::size_t>(size));
    stored.read(reinterpret_cast<char*>(m_bytes.data()), size);
    m_bytes.resize(static_cast<std::size_t>(stored.gcount()));
}

bool PromContent::erase() {
    m_bytes.clear();
    return m_file.empty() || std::ofstream(std::filesystem::u8path(m_file), std::ios::binary).good();
}

bool PromContent::program(int offset, const std::vector<unsigned char>& block) {
    const auto first = static_cast<std::size_t>(offset);
    const std::size_t oldEnd = m_bytes.size();
    m_bytes.resize(std::max(oldEnd, first + block.size()), erased);
    for (std::size_t i = 0; i < block.size(); ++i) {
        m_bytes[first + i] &= block[i];
    }
    return m_file.empty() || store(std::min(first, oldEnd), first + block.size());
}

std::vector<unsigned char> PromContent::read(int offset, int length) const {
    std::vector<unsigned char> block(static_cast<std::size_t>(length), erased);
    const std::size_t first = std::min(static_cast<std::size_t>(offset), m_bytes.size());
    const std::size_t count = std::min(block.size(), m_bytes.size() - first);
    std::copy_n(m_bytes.begin() + static_cast<std::ptrdiff_t>(first), count, block.begin());
    return block;
}

/// Writes these bytes to the file.
bool PromContent::store(std::size_t first, std::size_t last) const {
    const auto path = std::filesystem::u8path(m_file);
    std::fstream file(path, std::ios::in | std::ios::out | std::ios::binary);
    if (!file) {
        file.open(path, std::ios::out | std::ios::binary);
    }
    file.seekp(static_cast<std::streamoff>(first));
    file.write(reinterpret_cast<const char*>(m_bytes.data()) + first, static_cast<std::streamsize>(last - first));
    file.flush();
    return file.good();
}
