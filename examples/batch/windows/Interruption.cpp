#include "../Interruption.h"

#include <windows.h>

#include <atomic>

namespace {

std::atomic<bool> isNoted{false};

/// Runs on a thread of the host's. What it does not take ends the process.
BOOL WINAPI note(DWORD event) {
    const bool isKey = event == CTRL_C_EVENT || event == CTRL_BREAK_EVENT;
    return isKey && !isNoted.exchange(true) ? TRUE : FALSE;
}

}  // namespace

void Interruption::arm() {
    ::SetConsoleCtrlHandler(note, TRUE);
}

bool Interruption::isWanted() {
    return isNoted;
}
