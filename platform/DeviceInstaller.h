// The host's device installer: sets of devices, what the host knows of each, and the steps by which devices are
// registered, updated and removed. One operation is one call of the host; what to do about a failure is decided above.
//
// A device set, a configuration, a descriptor and a library are each given back once, by the call that is named for
// it. An operation that fails says so by its result, and lastError() then gives the host's number. All calls block
// for as long as the host takes, and none is meant for several threads at once.
#pragma once

#include <cstddef>
#include <cstdint>

namespace platform {

/// What identifies a class of devices.
struct DeviceClass {
    std::uint32_t data1;
    std::uint16_t data2;
    std::uint16_t data3;
    std::uint8_t data4[8];
};

/// Serial and parallel ports alike.
constexpr DeviceClass portsClass{0x4D36E978, 0xE325, 0x11CE, {0xBF, 0xC1, 0x08, 0x00, 0x2B, 0xE1, 0x03, 0x18}};
/// USB programming cables.
constexpr DeviceClass cableClass{0x62C3B72B, 0x1D17, 0x42ED, {0x84, 0x12, 0x6D, 0xFE, 0x78, 0x95, 0x45, 0x52}};

using DeviceSetHandle = std::intptr_t;
constexpr DeviceSetHandle noDeviceSet = -1;
using Machine = void*;  ///< null is this machine

/// A device as a member of a set.
struct DeviceRecord {
    DeviceClass deviceClass{};
    std::uint32_t node = 0;
    std::uintptr_t reserved = 0;
};

/// Which devices presentDevices() takes.
enum DeviceFlag : std::uint32_t { devicesPresent = 2, devicesOfAllClasses = 4 };

enum class DeviceProperty : std::uint32_t { Description = 0, HardwareIds = 1, CompatibleIds = 2, FriendlyName = 12 };

/// Types of a property's value.
constexpr std::uint32_t textType = 1;
constexpr std::uint32_t listType = 7;

/// The failure of a read into a buffer that is too small.
constexpr std::uint32_t bufferTooSmall = 122;

/// A status of a device with this bit has a problem.
constexpr std::uint32_t hasProblem = 0x400;
constexpr std::uint32_t problemHardwareDisabled = 29;

using LogicalConfiguration = std::uintptr_t;
using ResourceDescriptor = std::uintptr_t;
enum class ConfigurationKind : std::uint32_t { Allocated = 2, Boot = 3, Forced = 4 };

struct IoRange {
    std::uint64_t start = 0;
    std::uint64_t end = 0;  ///< the last address in the range
};

enum class InstallFunction : std::uint32_t { Remove = 5, RegisterDevice = 25 };

/// Flags of a device that takes its change only at the next start of the system.
constexpr std::uint32_t needsRestart = 0x80;
constexpr std::uint32_t needsReboot = 0x100;

using LibraryHandle = void*;
using UpdateEntry = void (*)();

class DeviceInstaller {
public:
    virtual ~DeviceInstaller() = default;
    virtual std::uint32_t lastError() = 0;

    // Sets. A class of null is none.
    virtual DeviceSetHandle createSet(const DeviceClass* deviceClass) = 0;
    virtual DeviceSetHandle createSetOnMachine(const DeviceClass* deviceClass) = 0;
    /// Adds the devices of the class to @p set and gives that; for noDeviceSet gives a new set.
    virtual DeviceSetHandle presentDevices(const DeviceClass* deviceClass, std::uint32_t flags,
                                           DeviceSetHandle set) = 0;
    virtual bool setDetail(DeviceSetHandle set, Machine& machine) = 0;
    /// The device at an index from 0; false past the last.
    virtual bool deviceAt(DeviceSetHandle set, std::uint32_t index, DeviceRecord& device) = 0;
    /// Adds a device by its instance id, present or not.
    virtual void openDevice(DeviceSetHandle set, const char* instanceId) = 0;
    virtual void destroySet(DeviceSetHandle set) = 0;

    // What the host knows of a device.
    /// Puts the type, the value and its size in bytes out. For a buffer that is too small puts the type and the size
    /// that is needed out and fails with bufferTooSmall.
    virtual bool property(DeviceSetHandle set, const DeviceRecord& device, DeviceProperty property, std::uint32_t& type,
                          char* buffer, std::uint32_t size, std::uint32_t& needed) = 0;
    /// The device's text in the host's tree of devices, terminated.
    virtual bool instanceId(const DeviceRecord& device, char* buffer, std::uint32_t size, Machine machine) = 0;
    virtual bool status(const DeviceRecord& device, Machine machine, std::uint32_t& status, std::uint32_t& problem) = 0;

    // Its I/O ranges: a configuration, and the descriptors in it.
    virtual bool configuration(const DeviceRecord& device, ConfigurationKind kind, Machine machine,
                               LogicalConfiguration& configuration) = 0;
    /// The I/O descriptor behind another one, or the first behind the configuration itself.
    virtual bool nextIoDescriptor(std::uintptr_t previous, ResourceDescriptor& descriptor) = 0;
    virtual bool ioRange(ResourceDescriptor descriptor, IoRange& range) = 0;
    virtual void freeDescriptor(ResourceDescriptor descriptor) = 0;
    virtual void freeConfiguration(LogicalConfiguration configuration) = 0;

    // Registration and removal.
    /// Number of characters of the full path, which is in the buffer if it is less than @p size; 0 for a failure.
    virtual std::uint32_t fullPath(const char* file, char* buffer, std::uint32_t size) = 0;
    /// The class that a set-up file declares; @p name has room for @p size characters.
    virtual bool setupFileClass(const char* path, DeviceClass& deviceClass, char* name, std::uint32_t size) = 0;
    /// The class of a name and how many classes have it; at most one is put out.
    virtual bool classOfName(const char* name, DeviceClass& deviceClass, std::uint32_t& count) = 0;
    /// A new device with an id that the host makes from the name.
    virtual bool createDevice(DeviceSetHandle set, const char* name, const DeviceClass& deviceClass,
                              DeviceRecord& device) = 0;
    virtual bool storeHardwareIds(DeviceSetHandle set, DeviceRecord& device, const char* list, std::uint32_t bytes) = 0;
    virtual bool callInstaller(InstallFunction function, DeviceSetHandle set, DeviceRecord& device) = 0;
    /// Marks a device for a removal from all hardware profiles.
    virtual bool prepareRemoval(DeviceSetHandle set, DeviceRecord& device) = 0;
    virtual bool installFlags(DeviceSetHandle set, const DeviceRecord& device, std::uint32_t& flags) = 0;

    // The driver update, which a host may lack.
    virtual LibraryHandle loadLibrary(const char* file) = 0;
    virtual UpdateEntry findEntry(LibraryHandle library, const char* name) = 0;
    /// Installs the driver of the set-up file on all devices of the hardware id, forced.
    virtual void updateDriver(UpdateEntry entry, const char* hardwareId, const char* path) = 0;
    virtual void freeLibrary(LibraryHandle library) = 0;
};

/// The one in use; null on a host that has none.
DeviceInstaller* deviceInstaller();
/// Puts another one in its place; null restores the host's own.
void replaceDeviceInstaller(DeviceInstaller* installer);

/// The host's own; null where there is none.
DeviceInstaller* realDeviceInstaller();

}  // namespace platform
