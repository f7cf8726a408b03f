// What the commands do beyond being checked.
#pragma once

#include <TessalUtility.h>

class Session;

/// Carries a checked command out. False when it failed, after a message.
using Handler = bool (*)(Session& session, const HkCmdArgs& args);

/// The handler of a command, null for one that is only checked. Names are in lower case.
Handler findHandler(const char* command);
