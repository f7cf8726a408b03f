/// @file
/// The base of messages between tool processes.
#pragma once

#include "Streamable.h"

class TessalSocket;

/// A message: a record with an id. The form of a derived message is its own.
class TESSAL_API NetMessage : public Streamable {
public:
    NetMessage() = default;
    NetMessage(const NetMessage&) = default;
    NetMessage& operator=(const NetMessage&) = default;

    /// A bare message streams as its id and a line feed.
    void readStream(std::istream& in) override;
    void writeStream(std::ostream& out) override;

    /// False: a bare message does nothing.
    bool execute(TessalSocket* socket);
};
