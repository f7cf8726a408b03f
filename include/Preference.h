/// @file
/// The tool's preferences: named settings, each with a value and a list of legal values.
#pragma once

#include <cstdint>
#include <vector>

#include "HkString.h"
#include "TessalExport.h"

// clang-format off
/// The rows of the shipped preference table, in the order of the data file:
///
/// - CABLE_AUTO_CONNECT: whether an operation without a cable reaches the device that the environment names
/// - VERIFY_AFTER_PROGRAM: whether a program operation verifies behind itself, without being told
/// - ERASE_BEFORE_PROGRAM: whether a program operation erases first, without being told
/// - DEFAULT_CABLE: generic port name of the cable to use
/// - DEFAULT_SPEED: cable speed in hertz where none is given
/// - FILE_OVERWRITE: whether what is read back replaces a file
/// - STOP_ON_ERROR: whether a script ends at its first bad line
/// - COLOUR: whether the console output is coloured
/// - PROGRESS_STYLE: how progress is shown
#define TESSAL_PREFERENCES(ROW) \
    ROW(CABLE_AUTO_CONNECT) \
    ROW(VERIFY_AFTER_PROGRAM) \
    ROW(ERASE_BEFORE_PROGRAM) \
    ROW(DEFAULT_CABLE) \
    ROW(DEFAULT_SPEED) \
    ROW(FILE_OVERWRITE) \
    ROW(STOP_ON_ERROR) \
    ROW(COLOUR) \
    ROW(PROGRESS_STYLE)
// clang-format on

/// One preference: its name, its value and its legal values.
class TESSAL_API TessalPrefOption {
public:
    /// Sets the name.
    void addOption(const char* name);
    const char* getOption() const { return m_option; }
    const char* getValue() const { return m_value; }
    /// Sets the value, in the letter case given, when it is one of the legal values in any case. Otherwise reports it
    /// and yields false.
    bool setValue(const char* value);
    /// Adds a legal value.
    void add2AllValue(const char* value);

private:
    HkString m_option;
    HkString m_value;
    std::vector<HkString> m_allValues;
};

/// The front of the process-wide preference table, which the key `PREFERENCE` of "tessal.acd" fills once.
///
/// A preference is named by its row in the data file. Changes live in memory only. One thread at a time.
class TESSAL_API TessalPreference {
public:
    /// The rows of the shipped data file; any row number is a value.
    enum PREFERENCE : std::int32_t {
#define TESSAL_ENUMERATOR(name) name,
        TESSAL_PREFERENCES(TESSAL_ENUMERATOR)
#undef TESSAL_ENUMERATOR
    };

    /// The one object; the first call builds it and loads the table.
    static TessalPreference* getPreferenceObject();
    /// Releases the object. The table stays as it is, and a later getPreferenceObject() works on it.
    static void removePreferenceObject();

    /// The value; empty, without a message, where there is no such row. Good until the value is set.
    const char* getPreference(PREFERENCE preference);
    /// True when the value is "TRUE" in any case.
    bool isPreferenceTrue(PREFERENCE preference);
    /// The value as a decimal number; 0 where it is none.
    int getPreferenceValue(PREFERENCE preference);

    /// Sets the value, in upper case, when it is one of the legal values in any case. Otherwise, and for a row that is
    /// not there, reports it, changes nothing and yields false.
    bool setPreference(PREFERENCE preference, const char* value);
    /// Sets "True" or "False".
    bool setPreference(PREFERENCE preference, bool value);
    /// Sets the decimal digits of the number.
    bool setPreference(PREFERENCE preference, int value);

    /// The name of the row. Throws DataNotFoundException where there is no such row.
    static const char* pref2String(PREFERENCE preference);
    /// The row of that name, in any case. Where there is none, reports it and throws DataNotFoundException.
    static PREFERENCE string2Pref(const char* name);
    /// Prints the table as status messages.
    static void dump();

private:
    TessalPreference();

    static TessalPreference* s_preferenceObject;
};
