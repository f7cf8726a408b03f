// Commands of docs/guides.md: a batch line, the format of its command, and the tables of a data file.

#include <TessalUtility.h>

#include <cstdio>
#include <memory>

namespace {

/// Takes a line apart, and checks it against the format that tessal.acd has for its command.
void check(const char* line) {
    const std::unique_ptr<CommandSet> command(CommandSet::string2CommandSet(line));
    command->decrementPositions();  // users count devices from 1, the library from 0
    const std::unique_ptr<HkCmdArgs> args(
        TessalCmdargs::getCmdargs(command->getNumberCommands(), command->getCommands(), true));
    std::printf("%s: position %s, file %s\n", args->command(), args->text("-p"), args->text("-file"));
}

void showCompletions() {
    for (const HkString& name : TessalCmdargs::findMatchingCommands("pr")) {
        std::printf("%s: %s\n", name.c_str(),
                    HkCmdArgs::description(TessalCmdargs::findBatchFormatString(name)).c_str());
    }
}

/// A table's rows, counted up to the first that is not there.
int countCommands() {
    AcdReader data;
    short row = 0;
    while (data.getDevkey()->getstringbykey("COMMAND_FORMAT", ":", row, ",", 0) != nullptr) {
        ++row;
    }
    return row;
}

}  // namespace

int main() {
    TessalCmdargs::createCommandMap();
    check("assignfile -p 2 -file \"C:/board 7/prom.mcs\"");
    showCompletions();
    return countCommands() > 10 ? 0 : 1;
}
