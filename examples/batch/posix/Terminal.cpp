#include "../Terminal.h"

#include <sys/ioctl.h>
#include <unistd.h>

#include <cstdlib>
#include <cstring>

Terminal standardOutput() {
    constexpr int usualWidth = 80;
    const char* const kind = std::getenv("TERM");
    if (::isatty(STDOUT_FILENO) == 0 || kind == nullptr || std::strcmp(kind, "dumb") == 0) {
        return {};
    }
    winsize size{};
    const bool isKnown = ::ioctl(STDOUT_FILENO, TIOCGWINSZ, &size) == 0 && size.ws_col > 0;
    return {isKnown ? size.ws_col : usualWidth, true};
}
