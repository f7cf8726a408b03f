#include "../ChildProcess.h"

#include <windows.h>

#include <chrono>
#include <stdexcept>

namespace {

using Clock = std::chrono::steady_clock;
constexpr std::chrono::seconds patience{60};

constexpr UINT killedStatus = 0xDEAD;

}  // namespace

struct ChildProcess::Body {
    PROCESS_INFORMATION process{};
    HANDLE toChild = nullptr;
    HANDLE fromChild = nullptr;
    std::string received;

    void start(const std::string& words);
    bool receive(Clock::time_point end);
    void kill() const;
    ~Body();
};

void ChildProcess::Body::start(const std::string& words) {
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
    std::string line = words;
    const BOOL started =
        ::CreateProcessA(program, line.data(), nullptr, nullptr, TRUE, 0, nullptr, nullptr, &startup, &process);
    ::CloseHandle(startup.hStdInput);
    ::CloseHandle(startup.hStdOutput);
    if (started == FALSE) {
        throw std::runtime_error("cannot start a child");
    }
}

bool ChildProcess::Body::receive(Clock::time_point end) {
    DWORD available = 0;
    while (available == 0) {
        if (::PeekNamedPipe(fromChild, nullptr, 0, nullptr, &available, nullptr) == FALSE || Clock::now() > end) {
            return false;
        }
        if (available == 0) {
            ::Sleep(1);
        }
    }
    char buffer[512];
    DWORD count = 0;
    ::ReadFile(fromChild, buffer, sizeof buffer, &count, nullptr);
    received.append(buffer, count);
    return count > 0;
}

void ChildProcess::Body::kill() const {
    ::TerminateProcess(process.hProcess, killedStatus);
    ::WaitForSingleObject(process.hProcess, INFINITE);
}

ChildProcess::Body::~Body() {
    if (process.hProcess != nullptr) {
        kill();
        ::CloseHandle(process.hProcess);
        ::CloseHandle(process.hThread);
    }
    ::CloseHandle(toChild);
    ::CloseHandle(fromChild);
}

ChildProcess::ChildProcess(const std::string& role, const std::vector<std::string>& arguments)
    : m_body(std::make_unique<Body>()) {
    std::string words = "child --role \"" + role + "\"";
    for (const std::string& argument : arguments) {
        words += " \"" + argument + "\"";
    }
    m_body->start(words);
}

ChildProcess::ChildProcess() = default;
ChildProcess::~ChildProcess() = default;
ChildProcess::ChildProcess(ChildProcess&&) noexcept = default;
ChildProcess& ChildProcess::operator=(ChildProcess&&) noexcept = default;

void ChildProcess::write(const std::string& line) {
    const std::string text = line + "\n";
    DWORD count = 0;
    ::WriteFile(m_body->toChild, text.data(), static_cast<DWORD>(text.size()), &count, nullptr);
}

std::string ChildProcess::read() {
    const auto end = Clock::now() + patience;
    std::size_t length = 0;
    while ((length = m_body->received.find('\n')) == std::string::npos) {
        if (!m_body->receive(end)) {
            return "(nothing)";
        }
    }
    std::string line = m_body->received.substr(0, length);
    m_body->received.erase(0, length + 1);
    if (!line.empty() && line.back() == '\r') {
        line.pop_back();
    }
    return line;
}

void ChildProcess::kill() {
    m_body->kill();
}

int ChildProcess::wait() {
    const auto bound = std::chrono::duration_cast<std::chrono::milliseconds>(patience).count();
    DWORD status = killedStatus;
    if (::WaitForSingleObject(m_body->process.hProcess, static_cast<DWORD>(bound)) == WAIT_OBJECT_0) {
        ::GetExitCodeProcess(m_body->process.hProcess, &status);
    }
    return status == killedStatus ? -1 : static_cast<int>(status);
}

long ChildProcess::id() const {
    return static_cast<long>(m_body->process.dwProcessId);
}
