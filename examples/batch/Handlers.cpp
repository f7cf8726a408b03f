#include "Handlers.h"

#include <cstdio>
#include <cstring>

#include "CableCommands.h"
#include "DeviceCommands.h"
#include "Help.h"
#include "HostCommands.h"
#include "ImageCommands.h"
#include "OptionCommands.h"
#include "Session.h"

namespace {

bool help(Session& session, const HkCmdArgs& args) {
    const char* const command = args.text("command");
    if (command == nullptr) {
        std::fputs(helpOnAll().c_str(), stdout);
        return true;
    }
    const std::string text = helpOn(command);
    if (text.empty()) {
        session.sayUnknown(command);
        return false;
    }
    std::fputs(text.c_str(), stdout);
    return true;
}

bool quit(Session& session, const HkCmdArgs&) {
    session.end();
    return true;
}

struct Row {
    const char* command;
    Handler handler;
};

constexpr Row rows[] = {
    {"assignfile", assignFile},
    {"checksum", checksum},
    {"closecable", closeCable},
    {"custcode", showOptions},
    {"erase", erase},
    {"generate", generate},
    {"help", help},
    {"identify", identify},
    {"info", info},
    {"preference", preference},
    {"program", program},
    {"quit", quit},
    {"readback", readback},
    {"setcable", setCable},
    {"verify", verify},
};

}  // namespace

Handler findHandler(const char* command) {
    for (const Row& row : rows) {
        if (std::strcmp(row.command, command) == 0) {
            return row.handler;
        }
    }
    return nullptr;
}
