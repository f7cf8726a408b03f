#include "Streamable.h"

#include "s/RecordReader.h"
#include "s/RecordWriter.h"

void Streamable::readStream(std::istream& in) {
    RecordReader(in).readInt(m_id);
}

void Streamable::writeStream(std::ostream& out) {
    RecordWriter record(out);
    record.addInt(m_id);
    record.finish();
}
