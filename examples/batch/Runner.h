// Runs the lines of a script or of a person.
#pragma once

#include <string>
#include <vector>

/// Exit status of the program.
enum Status { AllFine = 0, LinesRefused = 1, CannotRun = 2, Interrupted = 130 };

/// Runs a script, "-" being standard input, up to its end, the command that ends the run or, with @p stopOnError, the
/// first line that is refused. ^C ends it between two steps, with all given back.
Status runScript(const std::string& script, bool stopOnError);

/// Runs the one command that these words make.
Status runCommand(const std::vector<std::string>& words);

/// Asks a person for lines. Who types has seen each message, so lines that were refused do not count at the end.
Status runPrompt(bool stopOnError);
