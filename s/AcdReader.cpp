#include "AcdReader.h"

#include <limits>

#include "HkStr.h"

namespace {

constexpr const char* dataFile = "tessal.acd";
constexpr const char* defaultDevice = "base";
constexpr const char* listSeparator = ",";

/// Calls @p visit with each element of a list, up to the last that an index can name.
template <class Visitor>
void forEachElement(ProfileKeyTable& table, const char* key, Visitor visit) {
    for (int i = 0; i <= std::numeric_limits<short>::max(); ++i) {
        const char* const element = table.getstringbykey(key, listSeparator, static_cast<short>(i), nullptr, 0);
        if (element == nullptr) {
            return;
        }
        visit(element);
    }
}

}  // namespace

AcdReader::AcdReader() : AcdReader(defaultDevice) {}

AcdReader::AcdReader(const char* device) {
    setDevice(device);
}

AcdReader::~AcdReader() = default;

void AcdReader::setDevice(const char* device) {
    // The new selection comes before the old one goes, so that the name may be the old selection's own text.
    m_config = std::make_unique<DeviceProfile::ProfileConfig>(device, static_cast<unsigned char>(1), ProfilePartBound);
    m_devkey = std::make_unique<ProfileKeyTable>(dataFile, m_config.get(), static_cast<unsigned char>(1),
                                                 static_cast<unsigned char>(1), static_cast<unsigned char>(1));
}

const char* AcdReader::getStringByKey(const char* key) const {
    return m_devkey->getstringbykey(key, nullptr, 0, nullptr, 0);
}

std::int32_t AcdReader::getLongByKey(const char* key) const {
    return m_devkey->GetInt32ByKey(key, nullptr, 0, nullptr, 0);
}

bool AcdReader::isKey(const char* key) const {
    const char* const value = getStringByKey(key);
    return value != nullptr && HkString(value) == "TRUE";
}

std::vector<std::int32_t> AcdReader::getLongVectorByKey(const char* key) const {
    std::vector<std::int32_t> numbers;
    forEachElement(*m_devkey, key, [&](const char* element) { numbers.push_back(HkStr::AToI(element)); });
    return numbers;
}

std::vector<HkString> AcdReader::getStringVectorByKey(const char* key) const {
    std::vector<HkString> texts;
    forEachElement(*m_devkey, key, [&](const char* element) { texts.emplace_back(element); });
    return texts;
}

const char* AcdReader::getProfile() const {
    const char* const profile = m_config->get_profile();
    return profile != nullptr ? profile : defaultDevice;
}
