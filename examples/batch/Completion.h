// How a line can go on.
#pragma once

#include <string>
#include <vector>

/// The words that can stand last in the line, one a line of the result: commands, switches or values that begin with
/// the word there, or that can follow the blank there. Empty where nothing is known.
std::string completionsOf(const std::string& line);

/// What can stand last on a shell's command line of this program, a line each: the word, a tab and what it means. The
/// last of @p words is the one that is typed, and may be empty. Nothing where a file name may stand.
std::string completionsOf(const std::vector<std::string>& words);

/// The line that is asked about by `complete LINE`, or by a tab behind a line; false when @p line asks for nothing.
bool isCompletionQuery(const std::string& line, std::string& asked);
