// The command that tells what there is.
#pragma once

#include <TessalUtility.h>

class Session;

/// With -ports, lists the ports of the host in a table, with -prom the catalogue of PROM parts; any other topic is only
/// checked.
bool info(Session& session, const HkCmdArgs& args);
