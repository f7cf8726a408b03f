// The commands that choose the cable and leave it.
#pragma once

#include <TessalUtility.h>

class Session;

/// Takes the port, which is kept from other processes until it is given back, or tells who is in the way. A port is a
/// simulated device, "pipe:NAME" or "tcp:PORT", or one of the host's. "auto" is the device at the address in the
/// environment variable TESSAL_DEVICE or, without one, the port of the preference for cables.
bool setCable(Session& session, const HkCmdArgs& args);
/// Gives the port back.
bool closeCable(Session& session, const HkCmdArgs& args);
