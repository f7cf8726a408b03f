// The command that tells about the host.
#pragma once

#include <TessalUtility.h>

class Session;

/// With -ports, lists the ports of the host in a table; any other topic is only checked.
bool info(Session& session, const HkCmdArgs& args);
