// Options of docs/guides.md: settings become the arguments of a command, and a command's arguments are read.

#include <TessalUtility.h>

#include <cstdio>
#include <vector>

namespace {

void program(long long device, unsigned long long code, bool isProtected) {
    std::printf("device %lld, code %llX%s\n", device, code, isProtected ? ", read-protected" : "");
}

bool carryOut(int argc, const char* const* argv) {
    const HkCmdArgs args(argc, argv, "-p <device=int 1..255>... [-u <code=hex 1..8>] [-ver <revision=group 0|1 rp>]...",
                         nullptr, 0);
    if (args.iserror() != 0) {
        return false;  // the messages have gone out
    }
    for (int i = 0; i < args.valueCount("-p"); ++i) {
        program(args.integer("-p", i), args.hex("-u", 0, 0xFFFFFFFF), args.groupHas("-ver", "rp"));
    }
    return true;
}

}  // namespace

int main() {
    // What a dialogue has set, as the arguments of its command.
    DeviceOptionsMgr settings;
    settings.setOption(tESSALNS::USERCODE, "cafe");
    settings.setOption(tESSALNS::REV0_CHECKED, true);
    settings.setOption(tESSALNS::REV0_VALUE, true);
    settings.setOption(tESSALNS::REV0_RP, true);
    CommandSet command;
    for (const char* const word : {"program", "-p", "3", "4"}) {
        command.addCommand(word);
    }
    for (const HkString& argument : settings.getProgramOptions()) {
        command.addCommand(argument);
    }
    const bool isDone = carryOut(command.getNumberCommands(), command.getCommands());

    // A mistake is told with what was expected.
    HkMessageManager::setHandler([](const HkMessage& message, void*) { std::printf("> %s", message.text); }, nullptr);
    const char* const wrong[] = {"program", "-p", "0", "-ver", "0 pr"};
    return isDone && !carryOut(5, wrong) ? 0 : 1;
}
