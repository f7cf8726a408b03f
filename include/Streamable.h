/// @file
/// The root of all records that stream as text.
#pragma once

#include <iosfwd>

#include "DebugTrace.h"
#include "TessalExport.h"

/// Root of every record that is written to and read from a text stream.
///
/// The form is plain text, field behind field, with no header, tag or end mark: reader and writer agree on the type.
/// A number is decimal and followed by one line feed, whatever locale, base or width the stream was set to. Reading
/// behaves as formatted extraction: leading white space is skipped, and a field that does not fit sets the stream's
/// fail state, after which later fields stay as they are.
///
/// The destructor is not virtual: a record is not deleted through this class.
class TESSAL_API Streamable {
public:
    Streamable() = default;
    Streamable(const Streamable&) = default;
    Streamable& operator=(const Streamable&) = default;

    /// Reads the record's fields. The body given here reads the id and may be called by its qualified name.
    virtual void readStream(std::istream& in) = 0;
    /// Writes the record's fields. The body given here writes the id and may be called by its qualified name.
    virtual void writeStream(std::ostream& out) = 0;

    /// The id that was read or copied, 0 before.
    int getId() const { return m_id; }

protected:
    ~Streamable() = default;

    DebugTrace m_trace;
    int m_id = 0;
};
