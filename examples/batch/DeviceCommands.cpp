#include "DeviceCommands.h"

#include <cstdio>
#include <optional>
#include <string>

#include "../device/DeviceLink.h"
#include "Quoting.h"
#include "Session.h"

namespace {

std::string chosenDevice(const Session& session) {
    const char* const given = HkEnv::GetEnv("TESSAL_DEVICE");
    return !session.device().empty() || given == nullptr ? session.device() : given;
}

std::string chosenPort(const char* given) {
    return HkStr::ICompare(given, "auto") != 0
               ? given
               : TessalPreference::getPreferenceObject()->getPreference(TessalPreference::DEFAULT_CABLE);
}

void list(const ChainAnswer& answer) {
    int position = 0;
    for (const ChainDevice& device : answer.devices) {
        std::printf("  position %d: %s, device code %08X\n", ++position, quotedWhereNeeded(device.name).c_str(),
                    static_cast<unsigned int>(device.idCode));
    }
}

}  // namespace

bool setCable(Session& session, const HkCmdArgs& args) {
    const std::string port = chosenPort(args.text("-port", 0, ""));
    const bool isDevice = DeviceAddress::read(port).has_value();
    session.setDevice(isDevice ? port : "");
    session.port().giveBack();
    if (isDevice || port.empty()) {
        return true;
    }
    if (!session.port().take(port.c_str())) {
        session.say(quotedWhereNeeded(port) + ": " + session.port().failure());
        return false;
    }
    std::puts("  port taken");
    return true;
}

bool closeCable(Session& session, const HkCmdArgs&) {
    session.setDevice("");
    if (session.port().isTaken()) {
        session.port().giveBack();
        std::puts("  port given back");
    }
    return true;
}

bool identify(Session& session, const HkCmdArgs&) {
    const std::string device = chosenDevice(session);
    if (device.empty()) {
        std::puts("  no device: setcable -port takes pipe:NAME or tcp:PORT of one that is simulated");
        return true;
    }
    const std::optional<DeviceAddress> address = DeviceAddress::read(device);
    if (!address) {
        session.say("TESSAL_DEVICE is neither pipe:NAME nor tcp:PORT: " + quoted(device));
        return false;
    }
    ChainAnswer answer;
    if (!askDevice(*address, DeviceRequest::Identify, answer)) {
        session.say("no device answers at " + quotedWhereNeeded(device));
        return false;
    }
    list(answer);
    return true;
}
