#include "Handlers.h"

#include <cstdio>
#include <cstring>

#include "Help.h"
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
    {"help", help},
    {"quit", quit},
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
