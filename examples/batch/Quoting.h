// Words of a user in the prompt's own texts.
#pragma once

#include <string>
#include <string_view>

/// The word in quotes, control characters written as \xNN, cut where it is very long.
std::string quoted(std::string_view word);

/// The same, but a word without blanks and control characters stands as it is.
std::string quotedWhereNeeded(std::string_view word);
