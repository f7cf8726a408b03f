#include "../Terminal.h"

#include <windows.h>

Terminal standardOutput() {
    const HANDLE output = GetStdHandle(STD_OUTPUT_HANDLE);
    DWORD mode = 0;
    CONSOLE_SCREEN_BUFFER_INFO screen{};
    if (GetConsoleMode(output, &mode) == 0 || GetConsoleScreenBufferInfo(output, &screen) == 0) {
        return {};
    }
    constexpr DWORD takesEscapes = 0x0004;  // ENABLE_VIRTUAL_TERMINAL_PROCESSING, which older headers lack
    const bool hasColours = (mode & takesEscapes) != 0 || SetConsoleMode(output, mode | takesEscapes) != 0;
    return {screen.srWindow.Right - screen.srWindow.Left + 1, hasColours};
}
