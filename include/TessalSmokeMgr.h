/// @file
/// A status file that is written line by line.
#pragma once

#include <cstdio>

#include "HkString.h"
#include "TessalExport.h"

/// Writes formatted texts to a file that is open as long as the object lives.
///
/// Nothing is added to what the caller formats: no time, no prefix, no line end. Texts are sure to be in the file only
/// when the object is gone.
class TESSAL_API TessalSmokeMgr {
public:
    /// Opens the file for writing; one that exists loses its content. When that fails, nothing is reported and the
    /// object writes nowhere.
    explicit TessalSmokeMgr(const char* fileName);
    ~TessalSmokeMgr();
    TessalSmokeMgr(const TessalSmokeMgr&) = delete;
    TessalSmokeMgr& operator=(const TessalSmokeMgr&) = delete;

    /// Writes as printf does. False when the formatted text is empty, when there is no file, and for a null format;
    /// a failed write counts as written.
    bool smokeStatus(const char* format, ...) TESSAL_PRINTF(2, 3);

    /// Does nothing; true.
    bool open(const char* fileName);
    /// Does nothing; true. The destructor closes.
    bool close();

private:
    TessalSmokeMgr();

    std::FILE* m_file = nullptr;
    HkString m_fileName;
};
