/// @file
/// The machinery of the option tables: a description and a value for each row.
#pragma once

#include <cstddef>
#include <vector>

#include "HkString.h"
#include "OptionRow.h"
#include "TessalExport.h"

/// Describes one row of an option table.
class TESSAL_API U_AttributePair {
public:
    /// @param attribute the row's key text
    /// @param isBool true for a switch, false for an option that carries a text
    /// @param dashValue the text that stands for the row on a command line
    /// @param groupSize how many rows directly behind this switch belong to it; 0 for an ordinary row
    U_AttributePair(const char* attribute, bool isBool, const char* dashValue, int groupSize, bool enabled);

    bool isBool() const { return m_isBool; }
    int returnGroupSize() const { return m_groupSize; }
    void setGroupSize(int groupSize) { m_groupSize = groupSize; }
    HkString getAttribute() const { return m_attribute; }
    void setAttribute(HkString attribute) { m_attribute = std::move(attribute); }
    HkString getDashValue() const { return m_dashValue; }
    void setDashValue(HkString dashValue) { m_dashValue = std::move(dashValue); }
    /// A flag of the caller's; no output depends on it.
    bool isEnabled() const { return m_enabled; }
    void setEnabled(bool enabled) { m_enabled = enabled; }

private:
    friend class U_OptionsMgr;

    bool m_isBool;
    int m_groupSize;
    HkString m_attribute;
    HkString m_dashValue;
    bool m_enabled;
};

/// The value of one row. A text row with an empty text is one that is not given.
class TESSAL_API U_OptionsPair {
public:
    U_OptionsPair(HkString stringValue, bool boolValue, bool isBool);

private:
    friend class U_OptionsMgr;

    bool m_boolValue;
    HkString m_stringValue;
    bool m_isBool;
};

/// Holds the values of an option table and turns ranges of rows into command-line texts.
///
/// A derived manager owns the descriptions and passes them to the operations that need them; row i of the one belongs
/// to row i of the other. A value is in force as soon as it is written. Rows outside the table are refused by result
/// or passed over. One thread at a time uses an object.
class TESSAL_API U_OptionsMgr {
public:
    U_OptionsMgr() = default;
    explicit U_OptionsMgr(std::vector<U_OptionsPair>& options);
    U_OptionsMgr(const U_OptionsMgr&) = default;
    U_OptionsMgr& operator=(const U_OptionsMgr&) = default;
    ~U_OptionsMgr() = default;

    virtual HkString getNumberOfOptionsText() = 0;
    /// "_OptionEnabled"
    virtual HkString getOptionEnabledText();
    /// "_AssociatedDevice"
    virtual HkString getAssociatedDeviceText();

    /// Appends an unset row for each description.
    void init_options(std::vector<U_AttributePair> attributes);
    void addOption(U_OptionsPair option);

    /// Writes a row without a look at any description, its kind included: a switch takes @p boolValue, a text option
    /// @p stringValue. False, and nothing changes, for a row that is not there.
    bool setOption(int index, HkString stringValue, bool boolValue, bool isBool);
    /// Writes a text option; false, and nothing changes, where the row is not described as one.
    bool setOption(std::vector<U_AttributePair> attributes, int index, HkString value);
    /// The same, so that a literal is a text and not a truth value.
    bool setOption(std::vector<U_AttributePair> attributes, int index, const char* value);
    /// Writes a switch; false, and nothing changes, where the row is not described as one.
    bool setOption(std::vector<U_AttributePair> attributes, int index, bool value);

    /// True for a switch that is on; false for any other row.
    bool isOptionSet(int index) const;
    /// The text of a text option; empty for any other row.
    HkString getOptionString(int index) const;
    /// The truth value of the row, whatever its kind; false where there is no such row.
    bool getOption(int index) const;
    /// True when the row's value is that of a switch; false where there is no such row.
    bool isOptionBool(int index) const;

    /// The command-line texts of the rows from @p first up to but not including @p last, in row order.
    ///
    /// A switch that is on gives its dash value; a text option that is given gives its dash value, unless that is
    /// empty, and its text as two elements. A switch that leads a group gives one element: its dash value and, behind
    /// a blank each, the dash values of the members that are on and the dash value and text, joined, of the text
    /// members that are given. A group is passed over while its leader is off. Nothing is quoted.
    std::vector<HkString> getOptions(std::vector<U_AttributePair> attributes, int first, int last) const;

    /// Resets the rows from @p first up to but not including @p last to what init_options() made.
    void clearOptions(int first, int last);
    void clearAllOptions();

    /// Both change nothing: a value is in force as soon as it is written.
    void commit_options(std::vector<U_AttributePair> attributes);
    void commit_options(int index, std::vector<U_AttributePair> attributes);

    /// Prints every row as a status message.
    void dumpAllOptions() const;

protected:
    using Attributes = std::vector<U_AttributePair>;

    void setOptionsList(std::vector<U_OptionsPair> options);

    // The descriptions of a derived manager; nothing is found or done where there is no such row.
    static void appendDescriptions(const tESSALNS::OptionRow* rows, std::size_t count, Attributes& attributes);
    static HkString keyOf(const Attributes& attributes, int index);
    static bool isRowEnabled(const Attributes& attributes, int index);
    static bool enableRow(Attributes& attributes, int index, bool enabled);

    // The work of the operations of the same meaning above, on a table that is not copied.
    void appendRows(const Attributes& attributes);
    bool writeText(const Attributes& attributes, int index, HkString value);
    bool writeSwitch(const Attributes& attributes, int index, bool value);
    std::vector<HkString> texts(const Attributes& attributes, int first, int last) const;

private:
    bool isRow(int index) const;
    HkString groupText(const Attributes& attributes, std::size_t leader, std::size_t end) const;

    std::vector<U_OptionsPair> m_options;
};
