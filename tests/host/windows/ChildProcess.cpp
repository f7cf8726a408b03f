#include <windows.h>

#include <stdexcept>

#include "../ChildProcess.h"

namespace {

constexpr UINT killedStatus = 0xDEAD;

struct WindowsChild final : ChildProcess {
    PROCESS_INFORMATION process{};
    HANDLE toChild = nullptr;
    HANDLE fromChild = nullptr;

    explicit WindowsChild(std::string line) {
        SECURITY_ATTRIBUTES inherited{sizeof inherited, nullptr, TRUE};
        STARTUPINFOA startup{};
        startup.cb = sizeof startup;
        startup.dwFlags = STARTF_USESTDHANDLES;
        startup.hStdError = ::GetStdHandle(STD_ERROR_HANDLE);
        ::CreatePipe(&startup.hStdInput, &toChild, &inherited, 0);
        ::CreatePipe(&fromChild, &startup.hStdOutput, &inherited, 0);
        ::SetHandleInformation(toChild, HANDLE_FLAG_INHERIT, 0);
        ::SetHandleInformation(fromChild, HANDLE_FLAG_INHERIT, 0);
        char program[MAX_PATH];
        ::GetModuleFileNameA(nullptr, program, sizeof program);
        const BOOL started =
            ::CreateProcessA(program, line.data(), nullptr, nullptr, TRUE, 0, nullptr, nullptr, &startup, &process);
        ::CloseHandle(startup.hStdInput);
        ::CloseHandle(startup.hStdOutput);
        if (started == FALSE) {
            throw std::runtime_error("cannot start a child");
        }
    }

    ~WindowsChild() override {
        WindowsChild::kill();
        for (const HANDLE handle : {process.hProcess, process.hThread, toChild, fromChild}) {
            ::CloseHandle(handle);
        }
    }

    void send(const std::string& text) override {
        DWORD count = 0;
        ::WriteFile(toChild, text.data(), static_cast<DWORD>(text.size()), &count, nullptr);
    }

    std::string read() override {
        std::string line;
        DWORD count = 0;
        for (char byte = 0; ::ReadFile(fromChild, &byte, 1, &count, nullptr) != FALSE && byte != '\n';) {
            line += byte;
        }
        return line.substr(0, line.find('\r'));
    }

    void kill() override {
        ::TerminateProcess(process.hProcess, killedStatus);
        ::WaitForSingleObject(process.hProcess, INFINITE);
    }

    int wait() override {
        DWORD status = killedStatus;
        ::WaitForSingleObject(process.hProcess, INFINITE);
        ::GetExitCodeProcess(process.hProcess, &status);
        return status == killedStatus ? -1 : static_cast<int>(status);
    }
};

}  // namespace

std::unique_ptr<ChildProcess> ChildProcess::start(const std::string& role, const std::vector<std::string>& arguments) {
    std::string line = "child --role \"" + role + '"';
    for (const std::string& argument : arguments) {
        line += " \"" + argument + '"';
    }
    return std::make_unique<WindowsChild>(line);
}
