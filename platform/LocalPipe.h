// Named pipes between processes of one machine: byte streams, blocking, one client for each server end.
//
// A handle is the host's own number of an end; noPipe is none. A server end is one handle from its creation on: first
// it waits for its client, then it carries the bytes. On Windows a pipe is of the form "\\.\pipe\name". On POSIX hosts
// a name is the path of a local stream socket, which only its owner may connect to; a name in the Windows form is a
// socket of that name in the user's runtime directory, so that one name serves both hosts. A pipe exists while a server
// end lives, whatever is left in the file system of one that was killed.
//
// No call ends the process or is broken by a signal, and no end is inherited by programs that the process starts. A
// call that fails says so, and lastError() gives the host's number for it until the next call of the same thread.
#pragma once

#include <cstdint>

namespace platform {

using Pipe = std::uintptr_t;
constexpr Pipe noPipe = ~Pipe{0};

class PipeHost {
public:
    virtual ~PipeHost() = default;

    /// True while a server end of that name lives. Looking does not look like a client to the server.
    virtual bool exists(const char* name) = 0;
    /// A server end; noPipe where the name is none, is too long for the host or is taken.
    virtual Pipe create(const char* name) = 0;
    /// Blocks until a client is there; true at once where one was quicker.
    virtual bool waitForClient(Pipe pipe) = 0;
    /// A client end, at once; noPipe where no server waits for a client.
    virtual Pipe open(const char* name) = 0;
    /// Number of bytes moved, at least 1; -1 for a failure, of which a peer that has closed is one.
    virtual std::int64_t read(Pipe pipe, char* data, int length) = 0;
    virtual std::int64_t write(Pipe pipe, const char* data, int length) = 0;
    virtual void close(Pipe pipe) = 0;
    virtual int lastError() = 0;
};

/// The host's own.
PipeHost& pipeHost();

}  // namespace platform
