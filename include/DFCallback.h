/// @file
/// The record by which a data file is asked for, and the function that is called with it.
#pragma once

#include "HkString.h"
#include "Streamable.h"

/// A data file, how often it is used, and what the user said. It streams as nothing at all.
class TESSAL_API DFCallback : public Streamable {
public:
    /// The one record of the process; made at the first call and never released.
    static DFCallback* Instance();

    DFCallback(const DFCallback&) = default;
    DFCallback& operator=(const DFCallback&) = default;

    void readStream(std::istream& in) override;
    void writeStream(std::ostream& out) override;

    /// The setter stores a private copy; null counts as the empty text.
    const char* getFileName() const { return m_fileName; }
    void setFileName(const char* name) { m_fileName = name; }
    /// The values 1 and 2 suppress the call of the function.
    int getUserInput() const { return m_userInput; }
    void setUserInput(int input) { m_userInput = input; }
    int getUseMode() const { return m_useMode; }
    void setUseMode(int mode) { m_useMode = mode; }
    int getNumberOfFileInstances() const { return m_numberOfFileInstances; }
    void setNumberOfFileInstances(int number) { m_numberOfFileInstances = number; }

private:
    DFCallback() = default;

    HkString m_fileName;
    int m_userInput = 0;
    int m_useMode = 0;
    int m_numberOfFileInstances = 0;

    static DFCallback* m_instance;
};

/// Holds the function that is called with the record.
class TESSAL_API DFCallbackFunction {
public:
    void setFunction(bool (*function)(DFCallback&)) { m_function = function; }
    /// The function's result; false, without a call, where there is no function or record, or where the user's input
    /// is 1 or 2.
    bool callFunction(DFCallback* record);

private:
    bool (*m_function)(DFCallback&) = nullptr;
};
