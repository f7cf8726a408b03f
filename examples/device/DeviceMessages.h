// What the prompt and a simulated device say to each other.
#pragma once

#include <TessalUtility.h>

#include <string>
#include <vector>

/// What the prompt asks for. Its form is that of a bare message: the id says which request it is.
class DeviceRequest : public NetMessage {
public:
    enum Kind { None = 0, Identify = 1, Quit = 2 };

    explicit DeviceRequest(Kind kind = None) { m_id = kind; }
};

/// One device of a chain. The name holds no white space.
struct ChainDevice {
    std::string name;
    int idCode = 0;
};

/// The devices of the chain, the first one being next to the cable. Its id is that of the request, or 0 for a refusal.
class ChainAnswer : public NetMessage {
public:
    explicit ChainAnswer(int request = 0) { m_id = request; }

    /// A count outside 0 to 64, or a device that is not whole, sets the stream's fail state.
    void readStream(std::istream& in) override;
    void writeStream(std::ostream& out) override;

    std::vector<ChainDevice> devices;
};
