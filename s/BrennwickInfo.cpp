#include "BrennwickInfo.h"

#include "AcdReader.h"

BrennwickInfo::BrennwickInfo(const char* device) {
    AcdReader reader(device);
    m_firstBitStreamAddress = reader.getLongByKey("BIT0_ADDRESS");
    m_secondBitStreamAddress = reader.getLongByKey("BIT1_ADDRESS");
    m_firstBitStreamAddress2 = reader.getLongByKey("BIT0_2_ADDRESS");
    m_secondBitStreamAddress2 = reader.getLongByKey("BIT1_2_ADDRESS");
    m_numberOfDataStreams = reader.getLongByKey("NO_DATA_SECTORS");
    m_numberOfMbDataStreams = reader.getLongByKey("MB_NO_DATA_SECTORS");
    m_mbDataAddresses = reader.getLongVectorByKey("MB_DATA_ADDRESS");
    m_mbDataAddresses2 = reader.getLongVectorByKey("MB_DATA_ADDRESS_2");
    m_sectorAddresses = reader.getLongVectorByKey("SECTOR_ADDRESS");
    m_sectorAddresses2 = reader.getLongVectorByKey("SECTOR_ADDRESS_2");
    m_dataAddresses = reader.getLongVectorByKey("DATA_ADDRESS");
    m_dataAddresses2 = reader.getLongVectorByKey("DATA_ADDRESS_2");
}

std::int32_t BrennwickInfo::getFirstBitStreamAddress(bool second) const {
    return second ? m_firstBitStreamAddress2 : m_firstBitStreamAddress;
}

std::int32_t BrennwickInfo::getSecondBitStreamAddress(bool second) const {
    return second ? m_secondBitStreamAddress2 : m_secondBitStreamAddress;
}

int BrennwickInfo::getNumberOfDataStreams(bool mb) const {
    return mb ? m_numberOfMbDataStreams : m_numberOfDataStreams;
}

std::vector<std::int32_t> BrennwickInfo::getSectorAddress(bool second) const {
    return second ? m_sectorAddresses2 : m_sectorAddresses;
}

std::vector<std::int32_t> BrennwickInfo::getDataStreamAddresses(bool mb, bool second) const {
    if (mb) {
        return second ? m_mbDataAddresses2 : m_mbDataAddresses;
    }
    return second ? m_dataAddresses2 : m_dataAddresses;
}
