#include "NetString.h"

#include <string>

#include "HkStr.h"
#include "s/RecordStream.h"

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
    adopt(HkStr::Dup(text));
}

void NetString::adopt(char* text) {
    delete[] m_text;
    m_text = text;
}

void NetString::readStream(std::istream& in) {
    std::string text;
    if (readRecordText(in, text)) {
        setString(text.c_str());
    }
}

void NetString::writeStream(std::ostream& out) {
    RecordWriter record;
    record.addText(m_text);
    record.writeTo(out);
}
