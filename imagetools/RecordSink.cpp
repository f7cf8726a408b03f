#include "imagetools/RecordSink.h"

namespace ImageTools {

void RecordSink::write(const char* data, std::size_t size) {
    flush();
    m_isGood = m_isGood && m_file.write(data, size);
}

bool RecordSink::flush() {
    m_isGood = m_isGood && m_file.write(m_block.get(), m_used);
    m_used = 0;
    return m_isGood;
}

}  // namespace ImageTools
