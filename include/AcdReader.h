/// @file
/// Keyed access to the device data.
#pragma once

#include <cstdint>
#include <memory>
#include <vector>

#include "HkString.h"
#include "ProfileConfig.h"
#include "ProfileKeyTable.h"
#include "TessalExport.h"

/// One device selection with the key table of "tessal.acd" opened over it.
///
/// A reader is built for one read and thrown away: building one reads the data file. An absent key is no error. All
/// texts handed out belong to the reader's table or selection, and setDevice and the destructor end them. A reader
/// belongs to one thread at a time.
class TESSAL_API AcdReader {
public:
    /// Selects the device "base".
    AcdReader();
    /// Selects @p device; null stands for "base".
    explicit AcdReader(const char* device);
    ~AcdReader();
    AcdReader(const AcdReader&) = delete;
    AcdReader& operator=(const AcdReader&) = delete;

    /// Selects another device and opens the table anew. Ends what getStringByKey, getDevkey and getProfile gave.
    void setDevice(const char* device);

    /// The whole value of the key, or null.
    const char* getStringByKey(const char* key) const;
    /// The decimal number at the start of the key's value; 0 where there is none.
    std::int32_t getLongByKey(const char* key) const;
    /// True when the key's whole value is exactly "TRUE".
    bool isKey(const char* key) const;
    /// The comma-separated elements of the value as decimal numbers; empty when the key is absent. At most the first
    /// 32768 elements can be addressed.
    std::vector<std::int32_t> getLongVectorByKey(const char* key) const;
    /// The comma-separated elements of the value; empty when the key is absent.
    std::vector<HkString> getStringVectorByKey(const char* key) const;

    /// The key table; it stays owned by the reader.
    ProfileKeyTable* getDevkey() const { return m_devkey.get(); }
    /// The name of the selected device, "base" when the selection has none.
    const char* getProfile() const;

private:
    // The order matters: the table is released before the selection.
    std::unique_ptr<DeviceProfile::ProfileConfig> m_config;
    std::unique_ptr<ProfileKeyTable> m_devkey;
};
