// The way back from a command's checked arguments to the rows of an option table.
#pragma once

#include <TessalUtility.h>

#include <cstring>

/// Reads the rows of one operation, in their order, from the arguments of its command.
///
/// Rows that share a dash value are told apart by what stands behind it: a revision's switch by its digit. Where
/// nothing does, as with empty arguments, the first row takes the first of them, which gives the same arguments again.
template <class Manager, class Option>
class OptionReader {
public:
    OptionReader(const HkCmdArgs& args, const tESSALNS::OptionRow* rows, Manager& manager)
        : m_args(args),
          m_rows(rows),
          m_manager(manager),
          m_emptyLeft(args.count("")),
          m_bareSwitchesLeft(args.count(revisionSwitch) - args.valueCount(revisionSwitch)) {}

    /// The rows from @p first up to but not including @p last.
    void read(int first, int last) {
        for (int row = first; row < last; row += 1 + m_rows[row].groupSize) {
            readRow(row);
        }
    }

private:
    static constexpr const char* revisionSwitch = "-ver";

    void readRow(int row) {
        const tESSALNS::OptionRow& description = m_rows[row];
        if (description.dashValue[0] == '\0') {
            setSwitch(row, description.isSwitch() && m_emptyLeft-- > 0);
        } else if (!description.isSwitch()) {
            if (m_args.isGiven(description.dashValue)) {
                m_manager.setOption(static_cast<Option>(row), m_args.text(description.dashValue));
            }
        } else if (std::strcmp(description.dashValue, revisionSwitch) == 0) {
            setSwitch(row, valueOf(revisionSwitch, m_rows[row + 1].dashValue) >= 0 || m_bareSwitchesLeft-- > 0);
        } else if (isRevision(description.dashValue)) {
            readRevision(row);
        } else {
            setSwitch(row, m_args.isGiven(description.dashValue));
        }
    }

    static bool isRevision(const char* dashValue) {
        return dashValue[0] >= '0' && dashValue[0] <= '3' && dashValue[1] == '\0';
    }

    /// Which of the argument's values is of that revision; below 0 for none.
    int valueOf(const char* argument, const char* revision) const {
        for (int i = m_args.valueCount(argument) - 1; i >= 0; --i) {
            const HkString leader = m_args.groupLeader(argument, i);
            if (std::strcmp(leader.IsEmpty() ? m_args.text(argument, i, "") : leader.c_str(), revision) == 0) {
                return i;
            }
        }
        return -1;
    }

    /// A revision's digit and the members of its group, from the value that names it.
    void readRevision(int row) {
        for (const char* const argument : {revisionSwitch, "loose"}) {
            const int value = valueOf(argument, m_rows[row].dashValue);
            if (value >= 0) {
                setSwitch(row, true);
                readMembers(row, argument, value);
            }
        }
    }

    void readMembers(int leader, const char* argument, int value) {
        for (int row = leader + 1; row <= leader + m_rows[leader].groupSize; ++row) {
            const tESSALNS::OptionRow& member = m_rows[row];
            if (member.isSwitch()) {
                setSwitch(row, m_args.groupHas(argument, member.dashValue, value));
                continue;
            }
            HkString name(member.dashValue);  // ends in the colon that stands before its text
            const HkString bare(name.view().substr(0, name.Length() - 1));
            m_manager.setOption(static_cast<Option>(row), m_args.groupText(argument, bare, value));
        }
    }

    void setSwitch(int row, bool on) {
        if (on) {
            m_manager.setOption(static_cast<Option>(row), true);
        }
    }

    const HkCmdArgs& m_args;
    const tESSALNS::OptionRow* m_rows;
    Manager& m_manager;
    int m_emptyLeft;
    int m_bareSwitchesLeft;
};

using DeviceOptionReader = OptionReader<DeviceOptionsMgr, tESSALNS::PROGRAM_OPTION>;
