#include "platform/SystemRestart.h"

#include <windows.h>

namespace platform {
namespace {

class WindowsRestart : public SystemRestart {
public:
    std::uint32_t lastError() override { return GetLastError(); }

    int ask(const char* text, const char* title, std::uint32_t style) override {
        return MessageBoxA(nullptr, text, title, style);
    }

    bool openThreadToken(std::uint32_t access, Token& token) override {
        return OpenThreadToken(GetCurrentThread(), access, TRUE, &token) != 0;
    }
    bool openProcessToken(std::uint32_t access, Token& token) override {
        return OpenProcessToken(GetCurrentProcess(), access, &token) != 0;
    }
    bool findPrivilege(const char* name, Privilege& privilege) override {
        LUID id{};
        const bool isFound = LookupPrivilegeValueA(nullptr, name, &id) != 0;
        privilege.low = id.LowPart;
        privilege.high = id.HighPart;
        return isFound;
    }
    bool enablePrivilege(Token token, const Privilege& privilege) override {
        TOKEN_PRIVILEGES state{};
        state.PrivilegeCount = 1;
        state.Privileges[0].Luid.LowPart = privilege.low;
        state.Privileges[0].Luid.HighPart = privilege.high;
        state.Privileges[0].Attributes = SE_PRIVILEGE_ENABLED;
        return AdjustTokenPrivileges(token, FALSE, &state, 0, nullptr, nullptr) != 0;
    }
    void closeToken(Token token) override { CloseHandle(token); }

    bool exitSystem(std::uint32_t flags, std::uint32_t reason) override { return ExitWindowsEx(flags, reason) != 0; }
};

}  // namespace

SystemRestart* realSystemRestart() {
    static WindowsRestart restart;
    return &restart;
}

}  // namespace platform
