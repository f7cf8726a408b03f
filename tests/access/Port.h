// Ports that no other test, and no other run of the tests at the same time, uses; and a process that works on one.
#pragma once

#include <memory>
#include <string>

#include "Access.h"
#include "host/ChildProcess.h"
#include "host/Role.h"

/// An id of its own at each call.
int freshPort();

/// A process with one Access, which does what it is told by the lines "lock", "dec" and "clients", and answers each
/// with its result. Another role than "port user" ends in usePort().
std::unique_ptr<ChildProcess> startPortUser(int port, Access::ACCESS_TYPE type = Access::SHARE,
                                            const char* role = "port user");

/// What the process does: a role with a port and a type.
int usePort(const RoleArguments& arguments);

/// True if the machine holds nothing of the semaphore of a SHARE.
bool isNothingLeft(int port);

/// True if a new Access finds the port free and can take it, as it must where nobody else is.
bool isFree(int port);
