/// @file
/// The table of batch commands and the parser of a command by its format.
#pragma once

#include <map>
#include <string_view>
#include <vector>

#include "HkCmdArgs.h"
#include "HkString.h"
#include "TessalExport.h"

/// Orders texts by their bytes; a proper prefix comes first. A text may be looked up without making a string of it.
struct ltptstr {
    using is_transparent = void;

    bool operator()(const HkString& a, const HkString& b) const { return a.view() < b.view(); }
    bool operator()(const HkString& a, std::string_view b) const { return a.view() < b; }
    bool operator()(std::string_view a, const HkString& b) const { return a < b.view(); }
};

/// The commands that the key `COMMAND_FORMAT` of "tessal.acd" names, one process-wide table.
///
/// A row of the key is `name,TRUE,format`: names in lower case, "TRUE" in any case for a batch command, and the
/// argument format of HkCmdArgs. The first getCmdargs fills the table; whoever only looks up or lists calls
/// createCommandMap first. The table has no lock: filling it must not run beside other calls.
class TESSAL_API TessalCmdargs {
public:
    struct CommandFormat {
        HkString formatString;
        bool isBatch = false;
    };

    /// Reads all rows of the data file into the table. Rows of a name that is there already replace it.
    /// @throws DataMismatchException at a row without a format; the rows before it stay
    static void createCommandMap();

    /// The format of exactly this name, or the empty text. It belongs to the table and stays good until its row is
    /// read again.
    static const char* findFormatString(const char* command);
    /// The same for batch commands; the empty text for any other.
    static const char* findBatchFormatString(const char* command);

    /// Parses a command, whose word `argv[0]` is looked up in lower case, batch command or not.
    ///
    /// @param strict refuse arguments that do not fit; otherwise the caller asks `iserror` of the result
    /// @return a parser, which the caller releases with `delete`
    /// @throws ACDEntryNotFoundException for a word without a format, no word included
    /// @throws InvalidArgumentException when @p strict is set and the arguments do not fit
    /// @throws DataMismatchException as createCommandMap
    static HkCmdArgs* getCmdargs(int argc, char* const* argv, bool strict);

    /// The names of the batch commands that begin with @p prefix in any case, in the table's order.
    static std::vector<HkString> findMatchingCommands(const char* prefix);
    /// The names of all batch commands, in the table's order.
    static std::vector<HkString> findAllCommands();

private:
    static std::map<HkString, CommandFormat, ltptstr> m_tessalBatchCommands;
};
