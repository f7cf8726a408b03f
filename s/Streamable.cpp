#include "Streamable.h"

#include "s/RecordStream.h"
#include "s/RecordWriter.h"

void Streamable::readStream(std::istream& in) {
    readRecordInt(in, m_id);
}

void Streamable::writeStream(std::ostream& out) {
    RecordWriter record(out);
    record.addInt(m_id);
    record.finish();
}
