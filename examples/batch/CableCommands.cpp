#include "CableCommands.h"

#include <cstdio>
#include <string>

#include "../device/DeviceLink.h"
#include "Quoting.h"
#include "Session.h"

namespace {

TessalPreference& preferences() {
    return *TessalPreference::getPreferenceObject();
}

std::string chosenPort(const char* given) {
    if (HkStr::ICompare(given, "auto") != 0) {
        return given;
    }
    const char* const device = HkEnv::GetEnv("TESSAL_DEVICE");
    return device != nullptr && DeviceAddress::read(device)
               ? device
               : preferences().getPreference(TessalPreference::DEFAULT_CABLE);
}

bool takePort(Session& session, const std::string& port) {
    const auto device = DeviceAddress::read(port);
    const bool isTaken = device ? session.port().takeDevice(device->text()) : session.port().take(port.c_str());
    if (!isTaken) {
        session.say(quotedWhereNeeded(port) + ": " + session.port().failure());
        return false;
    }
    session.setDevice(device ? device->text() : "");
    std::puts("  port taken");
    return true;
}

}  // namespace

bool setCable(Session& session, const HkCmdArgs& args) {
    const int hertz = args.isGiven("-speed") ? static_cast<int>(args.integer("-speed"))
                                             : preferences().getPreferenceValue(TessalPreference::DEFAULT_SPEED);
    const char* const speed = CableInfo::getDisplaySpeedString(hertz);
    if (speed == nullptr) {
        return false;  // the message has gone out
    }
    session.leaveCable();
    const std::string port = chosenPort(args.text("-port", 0, ""));
    if (!port.empty() && !takePort(session, port)) {
        return false;
    }
    std::printf("  clock %s\n", speed);
    return true;
}

bool closeCable(Session& session, const HkCmdArgs&) {
    if (session.port().isTaken()) {
        std::puts("  port given back");
    }
    session.leaveCable();
    return true;
}
