// The commands that work on the devices of the chain.
//
// The chain is that which serves at the cable's port or, without one, at the address in the environment variable
// TESSAL_DEVICE. Without either, a line is only checked.
#pragma once

#include <TessalUtility.h>

class Session;

/// Lists the devices.
bool identify(Session& session, const HkCmdArgs& args);
/// Remembers the file of a position; it is read when it is needed.
bool assignFile(Session& session, const HkCmdArgs& args);
bool erase(Session& session, const HkCmdArgs& args);
/// Programs the assigned files, after an erasure with -e; -v compares afterwards.
bool program(Session& session, const HkCmdArgs& args);
bool verify(Session& session, const HkCmdArgs& args);
/// Writes as many bytes as the assigned file has, all of the PROM where none is assigned.
bool readback(Session& session, const HkCmdArgs& args);
