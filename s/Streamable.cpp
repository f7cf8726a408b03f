#include "Streamable.h"

#include "s/RecordStream.h"

void Streamable::readStream(std::istream& in) {
    readRecordInt(in, m_id);
}

void Streamable::writeStream(std::ostream& out) {
    RecordWriter record;
    record.addInt(m_id);
    record.writeTo(out);
}
