#include "TessalException.h"

TessalException::TessalException(const char* meaning, const char* module, const char* file, const char* revision,
                                 int line) noexcept
    : HkException(meaning, module, file, revision, line) {}

TessalException::~TessalException() = default;

void TessalException::generateReport() {
    compose();
    report();
}

// Each class of the family is its base with a meaning of its own.

TessalException::TessalException(const char* module, const char* file, const char* revision, int line) noexcept
    : HkException("TessalException: the operation failed", module, file, revision, line) {}

LogicException::LogicException(const char* module, const char* file, const char* revision, int line) noexcept
    : TessalException("LogicException: the request cannot be met", module, file, revision, line) {}

OutOfRangeException::OutOfRangeException(const char* module, const char* file, const char* revision, int line) noexcept
    : LogicException("OutOfRangeException: outside what there is", module, file, revision, line) {}

DataMismatchException::DataMismatchException(const char* module, const char* file, const char* revision,
                                             int line) noexcept
    : LogicException("DataMismatchException: not of the expected form", module, file, revision, line) {}

InvalidArgumentException::InvalidArgumentException(const char* module, const char* file, const char* revision,
                                                   int line) noexcept
    : LogicException("InvalidArgumentException: the arguments do not fit", module, file, revision, line) {}

DataNotFoundException::DataNotFoundException(const char* module, const char* file, const char* revision,
                                             int line) noexcept
    : LogicException("DataNotFoundException: not in the table", module, file, revision, line) {}

StreamException::StreamException(const char* module, const char* file, const char* revision, int line) noexcept
    : TessalException("StreamException: reading or writing failed", module, file, revision, line) {}

FileException::FileException(const char* module, const char* file, const char* revision, int line) noexcept
    : StreamException("FileException: the file cannot be used", module, file, revision, line) {}

ACDFileException::ACDFileException(const char* module, const char* file, const char* revision, int line) noexcept
    : FileException("ACDFileException: the data file cannot be used", module, file, revision, line) {}

ACDEntryNotFoundException::ACDEntryNotFoundException(const char* module, const char* file, const char* revision,
                                                     int line) noexcept
    : ACDFileException("ACDEntryNotFoundException: no such entry in the data file", module, file, revision, line) {}
