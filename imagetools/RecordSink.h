// Collects the text of a file in large blocks.
#pragma once

#include <cstddef>
#include <memory>
#include <string_view>

#include "platform/ReplacementFile.h"

namespace ImageTools {

class RecordSink {
public:
    explicit RecordSink(platform::ReplacementFile& file) : m_file(file), m_block(new char[blockSize]) {}

    /// Where a record of at most @p size characters can be written; advance() then tells where it ended.
    char* room(std::size_t size) {
        if (blockSize - m_used < size) {
            flush();
        }
        return m_block.get() + m_used;
    }
    void advance(const char* end) { m_used = static_cast<std::size_t>(end - m_block.get()); }

    /// Bytes of any number.
    void write(const char* data, std::size_t size);

    /// Sends on what is collected. False when anything could not be written, now or before.
    bool flush();

    /// What is sent on at once, at most.
    static constexpr std::size_t blockSize = std::size_t{256} << 10;

private:
    void send(const char* data, std::size_t size);

    platform::ReplacementFile& m_file;
    std::unique_ptr<char[]> m_block;
    std::size_t m_used = 0;
    bool m_isGood = true;
};

}  // namespace ImageTools
