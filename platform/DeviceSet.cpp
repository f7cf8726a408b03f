#include "platform/DeviceSet.h"

#include <algorithm>
#include <memory>
#include <new>

namespace platform {
namespace {

/// How a property of one type is read.
struct ReadRule {
    std::uint32_t type;
    std::uint32_t firstSize;
    std::uint32_t zerosBehind;  ///< bytes behind the size that is offered, which end the value
};

constexpr ReadRule textRule{textType, 1024, 1};
constexpr ReadRule listRule{listType, 8192, 2};

/// A property may grow between two calls, but not for ever.
constexpr int mostCalls = 16;
constexpr std::uint32_t largestSize = 1U << 20;

struct Value {
    std::unique_ptr<char[]> bytes;
    std::uint32_t size = 0;
};

/// The value, with its zeros behind it; no bytes when the host does not give it.
Value read(DeviceInstaller& installer, DeviceSetHandle set, const DeviceRecord& device, DeviceProperty property,
           const ReadRule& rule) {
    std::uint32_t offered = rule.firstSize;
    for (int call = 0; call < mostCalls && offered <= largestSize; ++call) {
        Value value{std::unique_ptr<char[]>(new (std::nothrow) char[offered + rule.zerosBehind]())};
        if (value.bytes == nullptr) {
            return {};
        }
        std::uint32_t type = 0;
        std::uint32_t size = 0;
        if (installer.property(set, device, property, type, value.bytes.get(), offered, size)) {
            value.size = std::min(size, offered);
            return value;
        }
        if (installer.lastError() != bufferTooSmall || type != rule.type) {
            return {};
        }
        offered = size;
    }
    return {};
}

DeviceSetHandle createSet(DeviceInstaller& installer, DeviceSetFailure& failure) {
    const DeviceSetHandle set = installer.createSet(nullptr);
    if (set == noDeviceSet) {
        failure = {"SetupDiCreateDeviceInfoList", installer.lastError()};
    }
    return set;
}

}  // namespace

std::optional<std::string> DeviceSet::text(const DeviceRecord& device, DeviceProperty property) const {
    const Value value = read(m_installer, m_handle, device, property, textRule);
    return value.bytes != nullptr ? std::optional<std::string>(value.bytes.get()) : std::nullopt;
}

std::vector<std::string> DeviceSet::list(const DeviceRecord& device, DeviceProperty property) const {
    std::vector<std::string> texts;
    const Value value = read(m_installer, m_handle, device, property, listRule);
    if (value.bytes != nullptr) {
        std::fill_n(value.bytes.get() + value.size, listRule.zerosBehind, '\0');
        for (const char* text = value.bytes.get(); *text != '\0'; text += texts.back().size() + 1) {
            texts.emplace_back(text);
        }
    }
    return texts;
}

ClassDevices::ClassDevices(DeviceInstaller& installer, const DeviceClass& deviceClass)
    : m_set(installer, createSet(installer, m_failure)) {
    if (!m_set.isOpen()) {
        return;
    }
    if (installer.presentDevices(&deviceClass, devicesPresent, m_set.handle()) == noDeviceSet) {
        m_failure = {"SetupDiGetClassDevsEx", installer.lastError()};
        return;
    }
    Machine machine = nullptr;
    installer.setDetail(m_set.handle(), machine);
}

}  // namespace platform
