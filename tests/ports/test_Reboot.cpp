// No test here restarts anything: each puts a scripted piece in the host's place.
#include <gtest/gtest.h>

#include <algorithm>
#include <string>
#include <tuple>
#include <vector>

#include "CableDriver.h"
#include "platform/SystemRestart.h"

namespace {

using Texts = std::vector<std::string>;
using platform::Privilege;
using platform::Token;

const char* const title = "Cable Driver Update";
const char* const first =
    "The system needs to be restarted to complete the driver update. Select OK to restart the system.";
const char* const second = "Select OK to restart the system immediately.";

class ScriptedRestart : public platform::SystemRestart {
public:
    ScriptedRestart() { platform::replaceSystemRestart(this); }
    ~ScriptedRestart() override { platform::replaceSystemRestart(nullptr); }

    Texts calls;
    Texts failing;
    std::uint32_t error = 0;
    int openTokens = 0;

    std::uint32_t lastError() override { return error; }
    int ask(const char* text, const char* caption, std::uint32_t style) override {
        return step(text) && caption == std::string(title) && style == 1 ? 1 : 2;
    }
    bool openThreadToken(std::uint32_t access, Token&) override { return open("thread", access); }
    bool openProcessToken(std::uint32_t access, Token&) override { return open("process", access); }
    bool findPrivilege(const char* name, Privilege&) override { return step(name); }
    bool enablePrivilege(Token, const Privilege&) override { return step("enable"); }
    void closeToken(Token) override { --openTokens; }
    bool exitSystem(std::uint32_t flags, std::uint32_t reason) override {
        return step("exit " + std::to_string(flags) + " " + std::to_string(reason));
    }

private:
    bool step(const std::string& call) {
        calls.push_back(call);
        return std::count(failing.begin(), failing.end(), call) == 0;
    }
    bool open(const char* call, std::uint32_t access) {
        const bool isOpen = step(call) && access == 0x28;
        openTokens += isOpen ? 1 : 0;
        return isOpen;
    }
};

TEST(Reboot, GoesStepByStepAndEndsAtANo) {
    const std::string privilege = "SeShutdownPrivilege";
    const std::string leave = "exit 6 0";
    const std::tuple<Texts, std::uint32_t, Texts> cases[] = {
        {{first}, 0, {first}},
        {{second}, 0, {first, second}},
        {{}, 0, {first, second, "thread", privilege, "enable", leave}},
        {{"thread"}, 1008, {first, second, "thread", "process", privilege, "enable", leave}},
        {{"thread"}, 5, {first, second, "thread", leave}},
        {{"thread", "process"}, 1008, {first, second, "thread", "process", leave}},
        {{privilege}, 0, {first, second, "thread", privilege, leave}},
        {{"enable"}, 0, {first, second, "thread", privilege, "enable", leave}},
        {{leave}, 0, {first, second, "thread", privilege, "enable", leave}},
    };
    for (const auto& [failing, error, calls] : cases) {
        SCOPED_TRACE(testing::PrintToString(failing));
        ScriptedRestart host;
        host.failing = failing;
        host.error = error;
        testing::internal::CaptureStdout();
        Reboot();
        EXPECT_EQ(testing::internal::GetCapturedStdout(), failing == Texts{leave} ? "ExitWindowsEx Error.\n" : "");
        EXPECT_EQ(host.calls, calls);
        EXPECT_EQ(host.openTokens, 0);
    }
}

}  // namespace
