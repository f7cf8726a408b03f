// What the prompt and a simulated device say to each other.
#pragma once

#include <TessalUtility.h>

#include <string>
#include <vector>

/// Bytes of a block at most; they go behind the message that announces them.
constexpr int longestBlock = 64 * 1024;

/// What the prompt asks for; the id says which request it is. The bytes of a block to program follow it.
class DeviceRequest : public NetMessage {
public:
    enum Kind { None = 0, Identify = 1, Quit = 2, Erase = 3, ProgramBlock = 4, ReadBlock = 5 };

    explicit DeviceRequest(Kind kind = None) { m_id = kind; }

    void readStream(std::istream& in) override;
    void writeStream(std::ostream& out) override;

    int position = 0;  ///< of the device in the chain, counted from 0
    int offset = 0;    ///< of the block in the PROM, in bytes
    int length = 0;    ///< of the block, in bytes
};

/// How a request about one device went. Its id is that of the request. The bytes of a block that was read follow it.
class DeviceAnswer : public NetMessage {
public:
    enum Result { Done = 0, NoPosition = 1, NoProm = 2, OutOfRange = 3, NotStored = 4 };

    explicit DeviceAnswer(int request = 0) { m_id = request; }

    void readStream(std::istream& in) override;
    void writeStream(std::ostream& out) override;

    int result = Done;
    int length = 0;  ///< bytes that follow
};

/// One device of a chain. The name holds no white space.
struct ChainDevice {
    std::string name;
    int idCode = 0;
};

/// The devices of the chain, the first one being next to the cable. Its id is that of the request.
class ChainAnswer : public NetMessage {
public:
    explicit ChainAnswer(int request = 0) { m_id = request; }

    /// A count outside 0 to 64, or a device that is not whole, sets the stream's fail state.
    void readStream(std::istream& in) override;
    void writeStream(std::ostream& out) override;

    std::vector<ChainDevice> devices;
};
