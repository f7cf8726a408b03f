#include "imagetools/RecordSink.h"

#include <algorithm>

#include "imagetools/WriteProgress.h"

namespace ImageTools {

void RecordSink::write(const char* data, std::size_t size) {
    flush();
    for (std::size_t part = 0; size > 0; data += part, size -= part) {
        part = std::min(size, blockSize);
        send(data, part);
    }
}

bool RecordSink::flush() {
    if (m_used > 0) {
        send(m_block.get(), m_used);
        m_used = 0;
    }
    return m_isGood;
}

void RecordSink::send(const char* data, std::size_t size) {
    m_isGood = m_isGood && m_file.write(data, size);
    WriteProgress::step();
}

}  // namespace ImageTools
