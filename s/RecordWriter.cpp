#include "s/RecordWriter.h"

#include <charconv>
#include <cstring>
#include <ostream>

void RecordWriter::addInt(int value) {
    constexpr std::size_t longest = 11;
    char* const place = room(longest + 1);
    char* const end = std::to_chars(place, place + longest, value).ptr;
    *end = '\n';
    m_size += static_cast<std::size_t>(end + 1 - place);
}

void RecordWriter::addText(const char* text) {
    const std::string_view view(text != nullptr ? text : "");
    addInt(static_cast<int>(view.size()));
    addLine(view);
}

void RecordWriter::addLine(const char* text) {
    addLine(std::string_view(text));
}

void RecordWriter::addLine(std::string_view text) {
    std::size_t size = text.size();
    if (size >= m_form.size()) {
        flush();
        m_out.write(text.data(), static_cast<std::streamsize>(size));
        size = 0;
    }
    char* const place = room(size + 1);
    std::memcpy(place, text.data(), size);
    place[size] = '\n';
    m_size += size + 1;
}

char* RecordWriter::room(std::size_t size) {
    if (size > m_form.size() - m_size) {
        flush();
    }
    return m_form.data() + m_size;
}

void RecordWriter::flush() {
    m_out.write(m_form.data(), static_cast<std::streamsize>(m_size));
    m_size = 0;
}

void RecordWriter::finish() {
    flush();
    m_out.width(0);
}
