#include <cstdio>

#include "CableDriver.h"
#include "platform/SystemRestart.h"

namespace {

using platform::SystemRestart;
using platform::Token;

SystemRestarter* callersRestarter = nullptr;

constexpr const char* title = "Cable Driver Update";
constexpr const char* questions[] = {
    "The system needs to be restarted to complete the driver update. Select OK to restart the system.",
    "Select OK to restart the system immediately.",
};

bool openToken(SystemRestart& host, Token& token) {
    return host.openThreadToken(platform::adjustAndQuery, token) ||
           (host.lastError() == platform::noToken && host.openProcessToken(platform::adjustAndQuery, token));
}

/// The restart is tried whatever comes of this.
void takePrivilege(SystemRestart& host) {
    Token token = nullptr;
    if (!openToken(host, token)) {
        return;
    }
    platform::Privilege privilege;
    if (host.findPrivilege("SeShutdownPrivilege", privilege)) {
        host.enablePrivilege(token, privilege);
    }
    host.closeToken(token);
}

class HostRestarter : public SystemRestarter {
public:
    explicit HostRestarter(SystemRestart& host) : m_host(host) {}

    bool confirm(const char* text, const char* caption) override {
        return m_host.ask(text, caption, platform::okAndCancel) == platform::answerOk;
    }
    bool restart() override {
        takePrivilege(m_host);
        return m_host.exitSystem(platform::restartForced, 0);
    }

private:
    SystemRestart& m_host;
};

void askAndRestart(SystemRestarter& restarter) {
    for (const char* const question : questions) {
        if (!restarter.confirm(question, title)) {
            return;
        }
    }
    if (!restarter.restart()) {
        std::printf("ExitWindowsEx Error.\n");
    }
}

}  // namespace

void setSystemRestarter(SystemRestarter* restarter) {
    callersRestarter = restarter;
}

void Reboot() {
    if (callersRestarter != nullptr) {
        askAndRestart(*callersRestarter);
    } else if (SystemRestart* const host = platform::systemRestart()) {
        HostRestarter restarter(*host);
        askAndRestart(restarter);
    }
}
