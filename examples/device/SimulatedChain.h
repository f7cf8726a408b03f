// The devices that are simulated, and the faults they can have.
#pragma once

#include <cstdint>
#include <memory>
#include <string>
#include <vector>

#include "DeviceLink.h"
#include "DeviceMessages.h"
#include "PromContent.h"

/// What goes wrong on purpose.
struct Faults {
    static constexpr std::int64_t never = -1;

    std::int64_t flippedBit = never;   ///< this bit of a PROM reads inverted; bit n is bit n % 8 of byte n / 8
    std::int64_t vanishAfter = never;  ///< the process ends when so many bytes of blocks have been transferred
    std::int64_t slowness = 0;         ///< microseconds that each block takes
};

/// A chain of three: two PROMs and a device that is none.
class SimulatedChain {
public:
    /// @param contentFile keeps the first PROM; the second one's file has ".2" behind the name. Empty: no file.
    SimulatedChain(const std::string& contentFile, const Faults& faults);

    /// Takes requests until the client closes, fails or says something else; true when it asked for the end.
    bool serve(DeviceLink& link);

private:
    bool answer(const DeviceRequest& request, DeviceLink& link);
    bool erase(const DeviceRequest& request, DeviceLink& link);
    bool program(const DeviceRequest& request, DeviceLink& link);
    bool read(const DeviceRequest& request, DeviceLink& link);
    DeviceAnswer::Result check(const DeviceRequest& request) const;
    void flip(int offset, std::vector<unsigned char>& block) const;
    int spend(int length);

    std::vector<std::unique_ptr<PromContent>> m_proms;  ///< null for a device that is none
    Faults m_faults;
};
