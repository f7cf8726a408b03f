// Ports that no other test, and no other run of the tests at the same time, uses; and a process that works on one.
#pragma once

#include <memory>

#include "Access.h"
#include "host/ChildProcess.h"

/// An id of its own at each call.
int freshPort();

/// A process with one Access, which does what it is told by the lines "lock", "dec" and "clients", and answers each
/// with its result.
std::unique_ptr<ChildProcess> startPortUser(int port, Access::ACCESS_TYPE type = Access::SHARE);

/// True if the machine holds nothing of the semaphore of a SHARE.
bool isNothingLeft(int port);

/// True if a new Access finds the port free and can take it, as it must where nobody else is.
bool isFree(int port);
