/// @file
/// The exception family: one chain of public bases below HkException.
#pragma once

#include "HkException.h"

/// Base of all exceptions of the tool. No class below adds data, so all of them copy alike.
///
/// Every class is built from the origin of the throw, the revision before the line.
class TESSAL_API TessalException : public HkException {
public:
    TessalException(const char* module, const char* file, const char* revision, int line) noexcept;
    TessalException(const TessalException&) = default;
    TessalException& operator=(const TessalException&) = default;
    ~TessalException() override;

    /// Composes the readable text anew and sends it as report() does.
    virtual void generateReport();

protected:
    TessalException(const char* meaning, const char* module, const char* file, const char* revision, int line) noexcept;
};

/// A request that cannot be met whatever the outside world does.
class TESSAL_API LogicException : public TessalException {
public:
    LogicException(const char* module, const char* file, const char* revision, int line) noexcept;

protected:
    using TessalException::TessalException;
};

/// An index or a part of the data lies outside what there is.
class TESSAL_API OutOfRangeException : public LogicException {
public:
    OutOfRangeException(const char* module, const char* file, const char* revision, int line) noexcept;
};

/// Text or data does not have the form that was expected.
class TESSAL_API DataMismatchException : public LogicException {
public:
    DataMismatchException(const char* module, const char* file, const char* revision, int line) noexcept;
};

/// The arguments of a command do not fit its format.
class TESSAL_API InvalidArgumentException : public LogicException {
public:
    InvalidArgumentException(const char* module, const char* file, const char* revision, int line) noexcept;
};

/// A name or code is not in its table.
class TESSAL_API DataNotFoundException : public LogicException {
public:
    DataNotFoundException(const char* module, const char* file, const char* revision, int line) noexcept;
};

/// Reading or writing went wrong.
class TESSAL_API StreamException : public TessalException {
public:
    StreamException(const char* module, const char* file, const char* revision, int line) noexcept;

protected:
    using TessalException::TessalException;
};

/// A file could not be used.
class TESSAL_API FileException : public StreamException {
public:
    FileException(const char* module, const char* file, const char* revision, int line) noexcept;

protected:
    using StreamException::StreamException;
};

/// A keyed data file could not be used.
class TESSAL_API ACDFileException : public FileException {
public:
    ACDFileException(const char* module, const char* file, const char* revision, int line) noexcept;

protected:
    using FileException::FileException;
};

/// A keyed data file has no entry of the wanted name.
class TESSAL_API ACDEntryNotFoundException : public ACDFileException {
public:
    ACDEntryNotFoundException(const char* module, const char* file, const char* revision, int line) noexcept;
};
