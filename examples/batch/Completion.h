// How a line can go on.
#pragma once

#include <string>

/// The words that can stand last in the line, one a line of the result: commands, switches or values that begin with
/// the word there, or that can follow the blank there. Empty where nothing is known.
std::string completionsOf(const std::string& line);

/// The line that is asked about by `complete LINE`, or by a tab behind a line; false when @p line asks for nothing.
bool isCompletionQuery(const std::string& line, std::string& asked);
