#include "platform/DeviceInstaller.h"

#include <windows.h>
// What follows needs the one above.
#include <cfgmgr32.h>
#include <setupapi.h>

#include <cstring>
#include <vector>

namespace platform {
namespace {

static_assert(sizeof(DeviceClass) == sizeof(GUID));

GUID toGuid(const DeviceClass& deviceClass) {
    GUID guid;
    std::memcpy(&guid, &deviceClass, sizeof guid);
    return guid;
}

DeviceClass fromGuid(const GUID& guid) {
    DeviceClass deviceClass;
    std::memcpy(&deviceClass, &guid, sizeof deviceClass);
    return deviceClass;
}

/// The host's form of a class that may be none.
class ClassArgument {
public:
    explicit ClassArgument(const DeviceClass* deviceClass) : m_isGiven(deviceClass != nullptr) {
        if (m_isGiven) {
            m_guid = toGuid(*deviceClass);
        }
    }
    const GUID* get() const { return m_isGiven ? &m_guid : nullptr; }

private:
    bool m_isGiven;
    GUID m_guid{};
};

HDEVINFO toSet(DeviceSetHandle set) {
    return reinterpret_cast<HDEVINFO>(set);
}

DeviceSetHandle fromSet(HDEVINFO set) {
    return reinterpret_cast<DeviceSetHandle>(set);
}

SP_DEVINFO_DATA toData(const DeviceRecord& device) {
    SP_DEVINFO_DATA data{};
    data.cbSize = sizeof data;
    data.ClassGuid = toGuid(device.deviceClass);
    data.DevInst = device.node;
    data.Reserved = device.reserved;
    return data;
}

DeviceRecord fromData(const SP_DEVINFO_DATA& data) {
    return {fromGuid(data.ClassGuid), data.DevInst, data.Reserved};
}

class WindowsInstaller : public DeviceInstaller {
public:
    std::uint32_t lastError() override { return GetLastError(); }

    DeviceSetHandle createSet(const DeviceClass* deviceClass) override {
        return fromSet(SetupDiCreateDeviceInfoList(ClassArgument(deviceClass).get(), nullptr));
    }
    DeviceSetHandle createSetOnMachine(const DeviceClass* deviceClass) override {
        return fromSet(SetupDiCreateDeviceInfoListExA(ClassArgument(deviceClass).get(), nullptr, nullptr, nullptr));
    }
    DeviceSetHandle presentDevices(const DeviceClass* deviceClass, std::uint32_t flags, DeviceSetHandle set) override {
        const HDEVINFO former = set != noDeviceSet ? toSet(set) : nullptr;
        return fromSet(SetupDiGetClassDevsExA(ClassArgument(deviceClass).get(), nullptr, nullptr, flags, former,
                                              nullptr, nullptr));
    }
    bool setDetail(DeviceSetHandle set, Machine& machine) override {
        SP_DEVINFO_LIST_DETAIL_DATA_A detail{};
        detail.cbSize = sizeof detail;
        if (SetupDiGetDeviceInfoListDetailA(toSet(set), &detail) == 0) {
            return false;
        }
        machine = detail.RemoteMachineHandle;
        return true;
    }
    bool deviceAt(DeviceSetHandle set, std::uint32_t index, DeviceRecord& device) override {
        SP_DEVINFO_DATA data{};
        data.cbSize = sizeof data;
        if (SetupDiEnumDeviceInfo(toSet(set), index, &data) == 0) {
            return false;
        }
        device = fromData(data);
        return true;
    }
    void openDevice(DeviceSetHandle set, const char* instanceId) override {
        SetupDiOpenDeviceInfoA(toSet(set), instanceId, nullptr, 0, nullptr);
    }
    void destroySet(DeviceSetHandle set) override { SetupDiDestroyDeviceInfoList(toSet(set)); }

    bool property(DeviceSetHandle set, const DeviceRecord& device, DeviceProperty property, std::uint32_t& type,
                  char* buffer, std::uint32_t size, std::uint32_t& needed) override {
        SP_DEVINFO_DATA data = toData(device);
        DWORD valueType = 0;
        DWORD valueSize = 0;
        const BOOL isRead =
            SetupDiGetDeviceRegistryPropertyA(toSet(set), &data, static_cast<DWORD>(property), &valueType,
                                              reinterpret_cast<BYTE*>(buffer), size, &valueSize);
        type = valueType;
        needed = valueSize;
        return isRead != 0;
    }
    bool instanceId(const DeviceRecord& device, char* buffer, std::uint32_t size, Machine machine) override {
        buffer[0] = '\0';
        if (CM_Get_Device_ID_ExA(device.node, buffer, size, 0, machine) != CR_SUCCESS) {
            return false;
        }
        // A host has been seen that succeeds and writes nothing.
        return buffer[0] != '\0' || CM_Get_Device_IDA(device.node, buffer, size, 0) == CR_SUCCESS;
    }
    bool status(const DeviceRecord& device, Machine machine, std::uint32_t& status, std::uint32_t& problem) override {
        ULONG statusBits = 0;
        ULONG problemNumber = 0;
        const CONFIGRET result = CM_Get_DevNode_Status_Ex(&statusBits, &problemNumber, device.node, 0, machine);
        status = statusBits;
        problem = problemNumber;
        return result == CR_SUCCESS;
    }

    bool configuration(const DeviceRecord& device, ConfigurationKind kind, Machine machine,
                       LogicalConfiguration& configuration) override {
        LOG_CONF found = 0;
        if (CM_Get_First_Log_Conf_Ex(&found, device.node, static_cast<ULONG>(kind), machine) != CR_SUCCESS) {
            return false;
        }
        configuration = found;
        return true;
    }
    bool nextIoDescriptor(std::uintptr_t previous, ResourceDescriptor& descriptor) override {
        RES_DES found = 0;
        RESOURCEID type = ResType_None;
        if (CM_Get_Next_Res_Des_Ex(&found, previous, ResType_IO, &type, 0, nullptr) != CR_SUCCESS) {
            return false;
        }
        descriptor = found;
        return true;
    }
    bool ioRange(ResourceDescriptor descriptor, IoRange& range) override {
        ULONG size = 0;
        if (CM_Get_Res_Des_Data_Size_Ex(&size, descriptor, 0, nullptr) != CR_SUCCESS || size < sizeof(IO_DES)) {
            return false;
        }
        std::vector<BYTE> data(size);
        if (CM_Get_Res_Des_Data_Ex(descriptor, data.data(), size, 0, nullptr) != CR_SUCCESS) {
            return false;
        }
        IO_DES header;
        std::memcpy(&header, data.data(), sizeof header);
        range = {header.IOD_Alloc_Base, header.IOD_Alloc_End};
        return true;
    }
    void freeDescriptor(ResourceDescriptor descriptor) override { CM_Free_Res_Des_Handle(descriptor); }
    void freeConfiguration(LogicalConfiguration configuration) override { CM_Free_Log_Conf_Handle(configuration); }

    std::uint32_t fullPath(const char* file, char* buffer, std::uint32_t size) override {
        return GetFullPathNameA(file, size, buffer, nullptr);
    }
    bool setupFileClass(const char* path, DeviceClass& deviceClass, char* name, std::uint32_t size) override {
        GUID guid{};
        const BOOL isFound = SetupDiGetINFClassA(path, &guid, name, size, nullptr);
        deviceClass = fromGuid(guid);
        return isFound != 0;
    }
    bool classOfName(const char* name, DeviceClass& deviceClass, std::uint32_t& count) override {
        GUID guid{};
        DWORD found = 0;
        const BOOL isFound = SetupDiClassGuidsFromNameExA(name, &guid, 1, &found, nullptr, nullptr);
        deviceClass = fromGuid(guid);
        count = found;
        return isFound != 0;
    }
    bool createDevice(DeviceSetHandle set, const char* name, const DeviceClass& deviceClass,
                      DeviceRecord& device) override {
        SP_DEVINFO_DATA data{};
        data.cbSize = sizeof data;
        const GUID guid = toGuid(deviceClass);
        if (SetupDiCreateDeviceInfoA(toSet(set), name, &guid, nullptr, nullptr, DICD_GENERATE_ID, &data) == 0) {
            return false;
        }
        device = fromData(data);
        return true;
    }
    bool storeHardwareIds(DeviceSetHandle set, DeviceRecord& device, const char* list, std::uint32_t bytes) override {
        SP_DEVINFO_DATA data = toData(device);
        const BOOL isStored = SetupDiSetDeviceRegistryPropertyA(toSet(set), &data, SPDRP_HARDWAREID,
                                                                reinterpret_cast<const BYTE*>(list), bytes);
        device = fromData(data);
        return isStored != 0;
    }
    bool callInstaller(InstallFunction function, DeviceSetHandle set, DeviceRecord& device) override {
        SP_DEVINFO_DATA data = toData(device);
        const BOOL isDone = SetupDiCallClassInstaller(static_cast<DI_FUNCTION>(function), toSet(set), &data);
        device = fromData(data);
        return isDone != 0;
    }
    bool prepareRemoval(DeviceSetHandle set, DeviceRecord& device) override {
        SP_DEVINFO_DATA data = toData(device);
        SP_REMOVEDEVICE_PARAMS parameters{};
        parameters.ClassInstallHeader.cbSize = sizeof parameters.ClassInstallHeader;
        parameters.ClassInstallHeader.InstallFunction = DIF_REMOVE;
        parameters.Scope = DI_REMOVEDEVICE_GLOBAL;
        return SetupDiSetClassInstallParamsA(toSet(set), &data, &parameters.ClassInstallHeader, sizeof parameters) != 0;
    }
    bool installFlags(DeviceSetHandle set, const DeviceRecord& device, std::uint32_t& flags) override {
        SP_DEVINFO_DATA data = toData(device);
        SP_DEVINSTALL_PARAMS_A parameters{};
        parameters.cbSize = sizeof parameters;
        if (SetupDiGetDeviceInstallParamsA(toSet(set), &data, &parameters) == 0) {
            return false;
        }
        flags = parameters.Flags;
        return true;
    }

    LibraryHandle loadLibrary(const char* file) override { return LoadLibraryA(file); }
    UpdateEntry findEntry(LibraryHandle library, const char* name) override {
        return reinterpret_cast<UpdateEntry>(GetProcAddress(static_cast<HMODULE>(library), name));
    }
    void updateDriver(UpdateEntry entry, const char* hardwareId, const char* path) override {
        using Update = BOOL(WINAPI*)(HWND, LPCSTR, LPCSTR, DWORD, PBOOL);
        constexpr DWORD force = 1;
        BOOL needsSystemRestart = FALSE;
        reinterpret_cast<Update>(entry)(nullptr, hardwareId, path, force, &needsSystemRestart);
    }
    void freeLibrary(LibraryHandle library) override { FreeLibrary(static_cast<HMODULE>(library)); }
};

}  // namespace

DeviceInstaller* realDeviceInstaller() {
    static WindowsInstaller installer;
    return &installer;
}

}  // namespace platform
