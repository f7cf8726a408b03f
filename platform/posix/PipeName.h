// The file system side of pipe names.
#pragma once

#include <string>

namespace platform {

/// The path of the socket that a pipe name stands for; empty, with errno set, where the name is none or the path is too
/// long for a socket. A name in the Windows form needs the user's runtime directory, which is made where it is missing
/// and refused where it is not the user's alone.
std::string pipePath(const char* name);

}  // namespace platform
