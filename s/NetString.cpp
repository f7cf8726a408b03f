#include "NetString.h"

#include <cstring>
#include <utility>

#include "s/RecordReader.h"
#include "s/RecordWriter.h"

// The copy's id is 0.
NetString::NetString(const NetString& other) : Streamable() {  // NOLINT(bugprone-copy-constructor-init)
    setString(other.m_text);
}

NetString& NetString::operator=(const NetString& other) {
    if (this != &other) {
        setString(other.m_text != nullptr ? other.m_text : "NetString");
    }
    return *this;
}

NetString::~NetString() {
    delete[] m_text;
}

void NetString::setString(const char* text) {
    assign(text != nullptr ? text : "");
}

void NetString::assign(std::string_view text) {
    char* former = nullptr;
    if (m_text == nullptr || text.size() > std::strlen(m_text)) {
        former = std::exchange(m_text, new char[text.size() + 1]);
    }
    std::memmove(m_text, text.data(), text.size());
    m_text[text.size()] = '\0';
    delete[] former;  // only now, for the text may be a piece of it
}

void NetString::readStream(std::istream& in) {
    RecordReader record(in);
    read(record);
}

void NetString::read(RecordReader& record) {
    std::string_view text;
    if (record.readText(text)) {
        assign(text);
    }
}

void NetString::writeStream(std::ostream& out) {
    RecordWriter record(out);
    record.addText(m_text);
    record.finish();
}
