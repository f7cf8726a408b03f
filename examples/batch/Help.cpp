#include "Help.h"

#include <TessalUtility.h>

#include <algorithm>
#include <vector>

std::string helpOnAll() {
    const std::vector<HkString> commands = TessalCmdargs::findAllCommands();
    std::size_t widest = 0;
    for (const HkString& command : commands) {
        widest = std::max<std::size_t>(widest, command.Length());
    }
    std::string text;
    for (const HkString& command : commands) {
        const char* const format = TessalCmdargs::findBatchFormatString(command);
        text += "  " + std::string(command) + std::string(widest + 2 - command.Length(), ' ') +
                HkCmdArgs::description(format).c_str() + "\n";
    }
    return text;
}

std::string helpOn(const char* command) {
    HkString name(command);
    name.MakeLower();
    const char* const format = TessalCmdargs::findBatchFormatString(name);
    return format[0] != '\0' ? HkCmdArgs::help(name, format).c_str() : "";
}
