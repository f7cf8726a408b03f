// The commands that choose a device and ask it.
#pragma once

#include <TessalUtility.h>

class Session;

/// Remembers the device where the port is one: "pipe:NAME" or "tcp:PORT". Any other port is taken for this process, or
/// it is told who is in the way; "auto" is the port of the preference for cables.
bool setCable(Session& session, const HkCmdArgs& args);
/// Forgets the device and gives the port back.
bool closeCable(Session& session, const HkCmdArgs& args);
/// Lists the devices of the chain that serves at the cable's port or, without one, at the address in the environment
/// variable TESSAL_DEVICE.
bool identify(Session& session, const HkCmdArgs& args);
