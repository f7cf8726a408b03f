/// @file
/// One batch command as a list of text tokens, with the tokeniser of a command line.
#pragma once

#include "TessalExport.h"

/// An owned, growing array of tokens: the command word and its arguments.
///
/// Count and array go straight to an argument parser. Tokens may be empty; null counts as the empty text. Copies are
/// independent. A set is used by one thread at a time.
class TESSAL_API CommandSet {
public:
    /// An empty set with room for @p capacity tokens, at least 1; the room doubles whenever it is full.
    explicit CommandSet(int capacity = 8);
    CommandSet(const CommandSet& other);
    CommandSet& operator=(const CommandSet& other);
    ~CommandSet();

    /// Appends a copy of @p token.
    void addCommand(const char* token);
    /// Appends the number in decimal.
    void addCommand(int value);

    int getNumberCommands() const { return m_count; }

    /// The token at @p index, or null at the count and past it; the set keeps the text. A negative index is the
    /// caller's fault.
    const char* getCommand(int index) const;

    /// The array itself, of which the first getNumberCommands() entries are tokens; no null entry ends it. It stays
    /// good until a token is added, a token until it is replaced.
    char** getCommands() { return m_tokens; }

    /// Replaces the token at @p index by a copy of @p token, which may be that very token.
    /// @throws OutOfRangeException for an index at the count or past it
    void resetCommand(int index, const char* token);

    /// Sends the command line, each token followed by a blank, as an information message or, with @p info false, to
    /// the debug channel.
    void printCommands(bool info) const;

    /// Splits a command line into its tokens, in time linear in its length.
    ///
    /// Tab, line feed, carriage return and blank separate tokens. A pair of double quotes makes one token of what is
    /// between them; the closing quote ends the token, letters directly before the opening one are dropped. There is
    /// no escape. A line whose first character is `#` is a comment.
    ///
    /// @return a new set, which the caller releases with `delete`; null when the line holds no token or is null
    /// @throws DataMismatchException after a message, when a quotation is not closed
    static CommandSet* string2CommandSet(const char* line);

    /// Adds 1 to every position: the tokens between `-p` or `-position` (in any case) and the next token that begins
    /// with `-`. Text that is no number counts as 0. Always true.
    bool incrementPositions();

    /// Takes 1 from every position. At a position that is 0 or no number it says so, stops and gives false; the
    /// positions before it stay changed.
    bool decrementPositions();

private:
    void append(const char* first, const char* last);
    void grow();

    int m_count;
    int m_capacity;
    char** m_tokens;
};
