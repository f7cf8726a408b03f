/// @file
/// A one-flag printer for tracing single objects.
#pragma once

#include "TessalExport.h"

/// Prints to standard output while its flag is on; its output does not pass through the message manager.
class TESSAL_API DebugTrace {
public:
    /// Turns the flag on when the environment variable `ZRX_TESSAL_TRACE_FLAG` reads "ON" in any case.
    DebugTrace();
    DebugTrace(const DebugTrace&) = default;
    DebugTrace& operator=(const DebugTrace&) = default;

    /// Prints as printf does when the flag is on, otherwise does nothing.
    void print(const char* format, ...) const TESSAL_PRINTF(2, 3);

private:
    unsigned char m_flag;
};
