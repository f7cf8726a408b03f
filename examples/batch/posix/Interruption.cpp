#include "../Interruption.h"

#include <csignal>

namespace {

volatile std::sig_atomic_t isNoted = 0;

void note(int) {
    isNoted = 1;
}

}  // namespace

void Interruption::arm() {
    struct sigaction action {};
    action.sa_handler = note;
    // A wait for the next line ends, it is not begun anew; the second signal finds what was there before.
    action.sa_flags = static_cast<int>(SA_RESETHAND);
    ::sigaction(SIGINT, &action, nullptr);
}

bool Interruption::isWanted() {
    return isNoted != 0;
}
