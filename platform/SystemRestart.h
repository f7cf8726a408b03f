// The host's restart: dialogues, the privilege that a restart takes, and the restart itself. One operation is one call
// of the host; what to do about a failure is decided above.
#pragma once

#include <cstdint>

namespace platform {

/// Buttons of a dialogue, and the answer that means yes.
constexpr std::uint32_t okAndCancel = 1;
constexpr int answerOk = 1;

/// What a token is opened for: to adjust its privileges and to ask for them.
constexpr std::uint32_t adjustAndQuery = 0x28;
/// The failure of a thread that has no token of its own.
constexpr std::uint32_t noToken = 1008;

/// Restart, whatever programs say.
constexpr std::uint32_t restartForced = 6;

using Token = void*;

struct Privilege {
    std::uint32_t low = 0;
    std::int32_t high = 0;
};

class SystemRestart {
public:
    virtual ~SystemRestart() = default;
    virtual std::uint32_t lastError() = 0;

    /// Blocks until the user has answered; gives the number of the button.
    virtual int ask(const char* text, const char* title, std::uint32_t style) = 0;

    virtual bool openThreadToken(std::uint32_t access, Token& token) = 0;
    virtual bool openProcessToken(std::uint32_t access, Token& token) = 0;
    virtual bool findPrivilege(const char* name, Privilege& privilege) = 0;
    virtual bool enablePrivilege(Token token, const Privilege& privilege) = 0;
    virtual void closeToken(Token token) = 0;

    virtual bool exitSystem(std::uint32_t flags, std::uint32_t reason) = 0;
};

/// The one in use; null on a host where the library restarts nothing by itself.
SystemRestart* systemRestart();
/// Puts another one in its place; null restores the host's own.
void replaceSystemRestart(SystemRestart* restart);

/// The host's own; null where there is none.
SystemRestart* realSystemRestart();

}  // namespace platform
