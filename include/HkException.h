/// @file
/// The root of everything that the library throws.
#pragma once

#include "TessalExport.h"

namespace HostKit {

/// Root of the exception family: the origin of a throw and the text that tells it.
///
/// Objects are thrown by value and hold no allocation, so copying and reporting them cannot fail. The origin texts
/// are constants of the throwing unit and are not copied.
class TESSAL_API HkException {
public:
    virtual ~HkException();

    /// The readable text, as what() gives it, in wide characters. Owned by the exception.
    virtual const wchar_t* getLocalized() const;

    /// Sends the readable text as an information message that carries the origin of the throw.
    virtual void report() const;

    /// The readable text: class, meaning, source path, line and revision. Owned by the exception.
    const char* what() const noexcept { return m_text; }

    const char* module() const noexcept { return m_module; }
    const char* file() const noexcept { return m_file; }
    const char* revision() const noexcept { return m_revision; }
    int line() const noexcept { return m_line; }

protected:
    /// @param meaning what has happened, such as "InvalidArgumentException: the arguments do not fit"; a constant
    HkException(const char* meaning, const char* module, const char* file, const char* revision, int line) noexcept;
    HkException(const HkException&) = default;
    HkException& operator=(const HkException&) = default;

    /// Writes the readable text from meaning and origin; a text too long for the object is cut.
    void compose() noexcept;

private:
    static constexpr unsigned textSize = 256;

    const char* m_meaning;
    const char* m_module;
    const char* m_file;
    const char* m_revision;
    int m_line;
    char m_text[textSize] = {};
    wchar_t m_localized[textSize] = {};
};

}  // namespace HostKit

using HostKit::HkException;
