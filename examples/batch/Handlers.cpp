#include "Handlers.h"

#include <cstdio>
#include <cstring>

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
    {"checksum", checksum},
    {"closecable", closeCable},
    {"custcode", showOptions},
    {"erase", showOptions},
    {"generate", generate},
    {"help", help},
    {"identify", identify},
    {"info", info},
    {"preference", preference},
    {"program", showOptions},
    {"quit", quit},
    {"readback", showOptions},
    {"setcable", setCable},
    {"verify", showOptions},
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
