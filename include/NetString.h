/// @file
/// The text field of records.
#pragma once

#include <string_view>

#include "Streamable.h"

class RecordReader;

/// A text that streams as its length, a line feed, its characters and a line feed.
///
/// A text with white space in it does not come back whole: reading ends at the first white space.
class TESSAL_API NetString : public Streamable {
public:
    /// No text: getString() gives null.
    NetString() = default;
    /// Copies the text; the id of the copy is 0.
    NetString(const NetString& other);
    /// Copies the text alone. A source without text gives the text "NetString"; assignment to itself changes nothing.
    NetString& operator=(const NetString& other);
    ~NetString();

    /// The text, null if there is none. Owned by the object; valid until its text changes.
    char* getString() { return m_text; }
    const char* getString() const { return m_text; }
    /// Stores a copy of @p text, which may be a piece of the present one; null counts as the empty text.
    void setString(const char* text);

    /// Reads length and text. At most that many characters are taken and no more memory than the stream really
    /// holds. Where the length cannot be read, or is negative, or no text follows it, the former text stays and the
    /// stream's fail state is set.
    void readStream(std::istream& in) override;
    void writeStream(std::ostream& out) override;

private:
    friend class CableInfo;  // reads all its fields by one reader

    void read(RecordReader& record);
    void assign(std::string_view text);

    char* m_text = nullptr;
};
