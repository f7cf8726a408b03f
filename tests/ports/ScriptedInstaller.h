// A device installer of made-up devices: it records each call, can fail any one of them, and counts what is open.
#pragma once

#include <gtest/gtest.h>

#include <algorithm>
#include <map>
#include <numeric>
#include <string>
#include <vector>

#include "platform/DeviceInstaller.h"

namespace platform {

struct FakeDevice {
    std::string id;
    std::map<DeviceProperty, std::string> properties;
    std::map<ConfigurationKind, std::vector<IoRange>> configurations = {};
    std::uint32_t status = 0;
    std::uint32_t problem = 0;
    std::uint32_t flags = 0;  ///< after its removal
};

/// Texts as the host keeps a list of them.
inline std::string asList(const std::vector<std::string>& texts) {
    std::string list;
    for (const std::string& text : texts) {
        list += text + '\0';
    }
    return list + '\0';
}

class ScriptedInstaller : public DeviceInstaller {
public:
    std::vector<FakeDevice> devices;
    std::vector<std::string> calls;
    std::vector<std::string> removed;
    std::string failing;      ///< the call that fails, by its text; the first of them
    std::size_t failAt = 0;   ///< or by its number from 1
    std::uint32_t error = 5;  ///< the host's number for that failure
    std::uint32_t classCount = 1;
    std::uint32_t pathLength = 20;
    std::uint32_t growth = 0;    ///< bytes by which a property grows at each read
    std::uint32_t repeated = 0;  ///< so many devices in place of a set's own, with descriptors for ever
    std::string hardwareIds;     ///< of the device that was registered

    /// Sets, configurations, descriptors and libraries that are open.
    int openThings() const { return m_open; }
    /// How often that was called.
    std::ptrdiff_t count(const std::string& call) const { return std::count(calls.begin(), calls.end(), call); }
    FakeDevice& add(FakeDevice device) { return devices.emplace_back(std::move(device)); }

    std::uint32_t lastError() override { return m_error; }
    DeviceSetHandle createSet(const DeviceClass* c) override { return newSet("createSet", c); }
    DeviceSetHandle createSetOnMachine(const DeviceClass* c) override { return newSet("createSetOnMachine", c); }
    DeviceSetHandle presentDevices(const DeviceClass* c, std::uint32_t flags, DeviceSetHandle former) override {
        const std::string call = "presentDevices" + nameOf(c) + " " + std::to_string(flags);
        const bool isNew = former == noDeviceSet;
        const DeviceSetHandle set = isNew ? newSet(call) : former;
        m_members.resize(devices.size());
        std::iota(m_members.begin(), m_members.end(), 0U);
        return isNew || step(call + " into") ? set : noDeviceSet;
    }
    bool setDetail(DeviceSetHandle, Machine&) override { return step("setDetail"); }
    bool deviceAt(DeviceSetHandle, std::uint32_t index, DeviceRecord& device) override {
        if (index >= (repeated != 0 ? repeated : m_members.size())) {
            return false;
        }
        device.node = m_members[index % m_members.size()];
        return true;
    }
    void openDevice(DeviceSetHandle, const char* id) override {
        step(std::string("openDevice ") + id);
        for (std::uint32_t i = 0; i < devices.size(); ++i) {
            if (devices[i].id == id) {
                m_members.push_back(i);
            }
        }
    }
    void destroySet(DeviceSetHandle) override { --m_open; }

    bool property(DeviceSetHandle, const DeviceRecord& device, DeviceProperty property, std::uint32_t& type,
                  char* buffer, std::uint32_t size, std::uint32_t& needed) override {
        const auto& properties = devices[device.node].properties;
        const auto found = properties.find(property);
        if (!step("property " + std::to_string(static_cast<int>(property)))) {
            return false;
        }
        if (found == properties.end()) {
            m_error = 13;
            return false;
        }
        const bool isList = property == DeviceProperty::HardwareIds || property == DeviceProperty::CompatibleIds;
        type = isList ? listType : textType;
        needed = static_cast<std::uint32_t>(found->second.size()) + m_grown;
        m_grown += growth;
        if (needed > size) {
            m_error = bufferTooSmall;
            return false;
        }
        found->second.copy(buffer, size);
        return true;
    }
    bool instanceId(const DeviceRecord& device, char* buffer, std::uint32_t size, Machine) override {
        devices[device.node].id.copy(buffer, size);
        return step("instanceId");
    }
    bool status(const DeviceRecord& device, Machine, std::uint32_t& status, std::uint32_t& problem) override {
        status = devices[device.node].status;
        problem = devices[device.node].problem;
        return step("status");
    }
    bool configuration(const DeviceRecord& device, ConfigurationKind kind, Machine,
                       LogicalConfiguration& configuration) override {
        const auto& all = devices[device.node].configurations;
        const auto found = all.find(kind);
        const bool isThere = found != all.end();
        m_ranges = isThere ? found->second : std::vector<IoRange>();
        configuration = firstDescriptor - 1;
        return open("configuration " + std::to_string(static_cast<int>(kind)), isThere);
    }
    bool nextIoDescriptor(std::uintptr_t previous, ResourceDescriptor& descriptor) override {
        descriptor = previous + 1;
        return open("nextIoDescriptor", repeated != 0 || descriptor - firstDescriptor < m_ranges.size());
    }
    bool ioRange(ResourceDescriptor descriptor, IoRange& range) override {
        range = m_ranges[(descriptor - firstDescriptor) % m_ranges.size()];
        return step("ioRange");
    }
    void freeDescriptor(ResourceDescriptor) override { --m_open; }
    void freeConfiguration(LogicalConfiguration) override { --m_open; }

    std::uint32_t fullPath(const char* file, char* buffer, std::uint32_t size) override {
        if (!step(std::string("fullPath ") + file)) {
            return 0;
        }
        std::string(file).copy(buffer, size);
        return pathLength;
    }
    bool setupFileClass(const char* path, DeviceClass& c, char* name, std::uint32_t size) override {
        c = cableClass;
        std::string("Cables").copy(name, size);
        return step(std::string("setupFileClass ") + path) && *path != '\0';
    }
    bool classOfName(const char* name, DeviceClass& c, std::uint32_t& count) override {
        c = portsClass;
        count = classCount;
        return step(std::string("classOfName ") + name);
    }
    bool createDevice(DeviceSetHandle, const char* name, const DeviceClass& c, DeviceRecord&) override {
        return step(std::string("createDevice ") + name + nameOf(&c));
    }
    bool storeHardwareIds(DeviceSetHandle, DeviceRecord&, const char* list, std::uint32_t bytes) override {
        hardwareIds.assign(list, bytes);
        return step("storeHardwareIds");
    }
    bool callInstaller(InstallFunction function, DeviceSetHandle, DeviceRecord& device) override {
        const bool isDone = step("callInstaller " + std::to_string(static_cast<int>(function)));
        if (isDone && function == InstallFunction::Remove) {
            removed.push_back(devices[device.node].id);
        }
        return isDone;
    }
    bool prepareRemoval(DeviceSetHandle, DeviceRecord&) override { return step("prepareRemoval"); }
    bool installFlags(DeviceSetHandle, const DeviceRecord& device, std::uint32_t& flags) override {
        flags = devices[device.node].flags;
        return step("installFlags");
    }
    LibraryHandle loadLibrary(const char* file) override {
        return open(std::string("loadLibrary ") + file) ? this : nullptr;
    }
    UpdateEntry findEntry(LibraryHandle, const char* name) override {
        return step(std::string("findEntry ") + name) ? +[] {} : nullptr;
    }
    void updateDriver(UpdateEntry, const char* hardwareId, const char* path) override {
        step(std::string("updateDriver ") + hardwareId + " " + path);
    }
    void freeLibrary(LibraryHandle) override { --m_open; }

private:
    static constexpr std::uintptr_t firstDescriptor = 1000;

    static std::string nameOf(const DeviceClass* c) {
        return c == nullptr ? "" : c->data1 == portsClass.data1 ? " Ports" : " Cables";
    }
    bool step(const std::string& call) {
        calls.push_back(call);
        const bool fails = calls.size() == failAt || call == failing;
        if (fails) {
            m_error = error;
            failing.clear();
        }
        return !fails;
    }
    bool open(const std::string& call, bool isThere = true) {
        const bool isOpen = step(call) && isThere;
        m_open += isOpen ? 1 : 0;
        return isOpen;
    }
    /// An empty set.
    DeviceSetHandle newSet(const std::string& call, const DeviceClass* c = nullptr) {
        m_members.clear();
        return open(call + nameOf(c)) ? 7 : noDeviceSet;
    }

    std::vector<std::uint32_t> m_members;
    std::vector<IoRange> m_ranges;
    std::uint32_t m_error = 0;
    std::uint32_t m_grown = 0;
    int m_open = 0;
};

}  // namespace platform
