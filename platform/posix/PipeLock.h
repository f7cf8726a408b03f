// Says that a pipe's server lives: a locked file beside the socket.
//
// The lock belongs to the open file description, so the kernel takes it away with the server, however that ends. The
// file is removed with the pipe. A child that is forked has no part in it: the descriptor is closed there.
#pragma once

#include <string>

namespace platform {

/// Takes the lock of the socket path for the server end that has this descriptor. False, with errno set, where another
/// server lives.
bool holdPipeLock(int serverEnd, const std::string& path);
/// Removes socket and lock file of the server end and gives its lock back; does nothing for any other descriptor.
void dropPipeLock(int serverEnd);
/// True while a server of the socket path lives.
bool isPipeLocked(const std::string& path);

}  // namespace platform
