/// @file
/// The process-wide funnel by which operations report their progress.
#pragma once

#include "Callback.h"

/// One record and one function for the whole process, used by one thread at a time.
///
/// Every operation gives the function's result or, where the filter or a guard stops the call, false; without a record
/// it gives true.
class TESSAL_API ProgressInterfaceClass {
public:
    /// Registers the function that gets the progress; true.
    static bool setCallbackFunction(bool (*function)(Callback&));
    static Callback* getCBData() { return m_cbData; }
    /// Hands the record on as it is.
    static bool callCallbackFunction();

    /// An operation of @p total steps begins.
    static bool startProgressUpdate(int total, const char* text);
    static bool startProgressUpdate(int total);
    /// One step was done. False, without a call, where the operation has no steps or all of them, and one more, are
    /// done.
    static bool updateProgress();
    static bool setProgressText(const char* text);
    /// The operation has ended, whatever number of steps was done. False, without a call, where it has no steps.
    static bool endProgressUpdate();
    /// The operation has ended where it stands, short of its steps: it failed or was stopped.
    static bool stopProgressUpdate();

    static void setTessalMode(tESSALNS::MODE_TYPE mode);
    static void setTessalSubMode(tESSALNS::SUBMODE_TYPE subMode);

    /// Made when the library is loaded and never released; null if there was no memory.
    static Callback* m_cbData;
    static CallbackFunction* m_callback;
};
