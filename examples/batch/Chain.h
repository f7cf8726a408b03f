// The devices behind the cable, during one command.
#pragma once

#include <TessalUtility.h>

#include <functional>
#include <memory>
#include <optional>
#include <string>
#include <utility>
#include <vector>

#include "../device/DeviceClient.h"
#include "PortLock.h"

class Session;

/// A PROM of the chain, as the operations on it need it.
struct Prom {
    Session& session;
    DeviceClient& device;
    int position;  ///< counted from 0
    int size;      ///< in bytes, that of the catalogue

    /// Reports something about it; gives false.
    bool fail(const std::string& text) const;
};

/// A connection to the chain, whose devices have told their names. Without a cable it takes the port while it lives.
class Chain {
public:
    /// Nothing, after a message, where the port is taken or no device answers.
    static std::unique_ptr<Chain> open(Session& session, const std::string& address);

    const std::vector<ChainDevice>& devices() const { return m_devices; }
    /// Nothing, after a message, where no PROM of the catalogue is at the position.
    std::optional<Prom> findProm(int position);

private:
    Chain(Session& session, const DeviceAddress& address, PortLock port)
        : m_session(session), m_port(std::move(port)), m_client(address) {}

    Session& m_session;
    PortLock m_port;
    DeviceClient m_client;
    std::vector<ChainDevice> m_devices;
};

/// Carries an operation out on the chain. Without a device the line is only checked, which is said.
bool withChain(Session& session, const std::function<bool(Chain&)>& operation);

/// The same on the PROM at each of the command's positions, up to the first that fails.
bool forEachProm(Session& session, const HkCmdArgs& args, const std::function<bool(Prom&)>& operation);
