/// @file
/// The record of an operation's progress and the filter that hands it on.
#pragma once

#include "HkString.h"
#include "Streamable.h"
#include "ToolModes.h"

/// What a call of the progress function reports.
enum PROGRESS_STATUS : std::int32_t {
    PROGRESS_START = 0,   ///< an operation begins
    PROGRESS_END = 1,     ///< it has ended
    PROGRESS_UPDATE = 2,  ///< one step was done
    PROGRESS_TEXT = 3     ///< the text changed
};

/// The progress of one operation, as the user interface gets it.
///
/// Streams as total count, current count and status, a line each, and the text as a fourth line. Reading takes the
/// three numbers and leaves the text's line in the stream.
class TESSAL_API Callback : public Streamable {
public:
    Callback() = default;
    /// Copies all but the id, which is 0 in the copy.
    Callback(const Callback& other);
    /// Copies all, the id too.
    Callback& operator=(const Callback& other) = default;

    void readStream(std::istream& in) override;
    void writeStream(std::ostream& out) override;

    /// Number of steps of the operation.
    int getTotalCount() const { return m_totalCount; }
    void setTotalCount(int count) { m_totalCount = count; }
    /// Number of steps done.
    int getCurrentCount() const { return m_currentCount; }
    void setCurrentCount(int count) { m_currentCount = count; }
    /// One of PROGRESS_STATUS.
    int getProgressStatus() const { return m_progressStatus; }
    void setProgressStatus(int status) { m_progressStatus = status; }

    /// The texts are private copies; null counts as the empty text.
    const char* getCallbackText() const { return m_callbackText; }
    void setCallbackText(const char* text) { m_callbackText = text; }
    const char* getPromptText() const { return m_promptText; }
    void setPromptText(const char* text) { m_promptText = text; }

    tESSALNS::MODE_TYPE getMode() const { return m_mode; }
    void setMode(tESSALNS::MODE_TYPE mode) { m_mode = mode; }
    tESSALNS::SUBMODE_TYPE getSubMode() const { return m_subMode; }
    void setSubMode(tESSALNS::SUBMODE_TYPE subMode) { m_subMode = subMode; }

private:
    int m_totalCount = 0;
    int m_currentCount = 0;
    int m_progressStatus = PROGRESS_START;
    HkString m_callbackText;
    HkString m_promptText;
    tESSALNS::MODE_TYPE m_mode = tESSALNS::MODE_NONE;
    tESSALNS::SUBMODE_TYPE m_subMode = tESSALNS::SUBMODE_NONE;
};

/// Hands progress records to a function, at most once for each percent.
///
/// Records of any status but PROGRESS_UPDATE always reach the function. An update reaches it when its percent differs
/// from that of the last update let through, or when more than 10 whole seconds have passed since the last one held
/// back. The clock is shared by all objects: milliseconds of wall-clock time since the process started.
class TESSAL_API CallbackFunction {
public:
    /// The function's result goes back to whoever reports the progress. Null: no function.
    void setFunction(bool (*function)(Callback&)) { m_function = function; }

    /// The function's result; false where there is no function, where the filter holds the record back, and for an
    /// update of an operation without steps.
    bool callFunction(Callback& record);

private:
    bool isHeldBack(int percent, int now);

    bool (*m_function)(Callback&) = nullptr;
    int m_lastPercent = -1;
};
