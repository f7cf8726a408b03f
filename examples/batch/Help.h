// Help texts of the batch commands.
#pragma once

#include <string>

/// All commands, a line each.
std::string helpOnAll();

/// One command with its arguments; empty when there is no such batch command. Case does not count.
std::string helpOn(const char* command);
