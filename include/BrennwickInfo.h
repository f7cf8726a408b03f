/// @file
/// The memory layout of one device of the Brennwick PROM family.
#pragma once

#include <cstdint>
#include <vector>

#include "TessalExport.h"

/// The layout of one device, read from its section of "tessal.acd" at construction and fixed afterwards.
///
/// Each address comes in a plain and a second edition; sector counts and data addresses also in a plain and a
/// multi-boot edition. A number that the device does not have is 0, a list that it does not have is empty. A
/// constructed object may be read from any thread.
class TESSAL_API BrennwickInfo {
public:
    explicit BrennwickInfo(const char* device);

    std::int32_t getFirstBitStreamAddress(bool second) const;
    std::int32_t getSecondBitStreamAddress(bool second) const;
    /// The argument chooses the multi-boot edition.
    int getNumberOfDataStreams(bool mb) const;
    std::vector<std::int32_t> getSectorAddress(bool second) const;
    std::vector<std::int32_t> getDataStreamAddresses(bool mb, bool second) const;

private:
    std::int32_t m_firstBitStreamAddress = 0;
    std::int32_t m_firstBitStreamAddress2 = 0;
    std::int32_t m_secondBitStreamAddress = 0;
    std::int32_t m_secondBitStreamAddress2 = 0;
    int m_numberOfDataStreams = 0;
    int m_numberOfMbDataStreams = 0;
    std::vector<std::int32_t> m_dataAddresses;
    std::vector<std::int32_t> m_dataAddresses2;
    std::vector<std::int32_t> m_mbDataAddresses;
    std::vector<std::int32_t> m_mbDataAddresses2;
    std::vector<std::int32_t> m_sectorAddresses2;
    std::vector<std::int32_t> m_sectorAddresses;
};
