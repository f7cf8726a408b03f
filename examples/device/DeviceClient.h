// The prompt's side of a connection to a simulated device.
#pragma once

#include <TessalUtility.h>

#include <string>
#include <vector>

#include "DeviceLink.h"
#include "DeviceMessages.h"

/// A connection that carries one request after the other. Each operation is false where it failed; failure() then says
/// why, and where the device is gone nothing more can be asked.
class DeviceClient {
public:
    /// Tries for a moment to connect; isConnected() tells whether it could.
    explicit DeviceClient(const DeviceAddress& address);
    bool isConnected() const { return m_isConnected; }

    bool identify(std::vector<ChainDevice>& devices);
    /// Ends the device.
    bool quit();
    bool erase(int position);
    /// @param length at most longestBlock
    bool program(int position, int offset, const unsigned char* block, int length);
    bool read(int position, int offset, unsigned char* block, int length);

    const std::string& failure() const { return m_failure; }

private:
    bool ask(DeviceRequest& request, NetMessage& answer, const unsigned char* block = nullptr);
    bool isDone(const DeviceAnswer& answer, int expectedLength);
    bool lose();

    TessalPipe m_pipe;  ///< one of the two is used
    TessalSocket m_socket;
    DeviceLink m_link;
    bool m_isConnected;
    std::string m_failure;
};
