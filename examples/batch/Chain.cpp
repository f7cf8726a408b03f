#include "Chain.h"

#include <cstdio>

#include "OptionCommands.h"
#include "Quoting.h"
#include "Session.h"

namespace {

std::string placeOf(int position) {
    return "position " + std::to_string(position + 1) + ": ";
}

/// The address of the device that the cable leads to or, without a cable to one and where that is preferred, that of
/// the environment; empty for none.
std::string deviceAddress(const Session& session) {
    const char* const given = HkEnv::GetEnv("TESSAL_DEVICE");
    const bool isGiven = given != nullptr && isPreferred(TessalPreference::CABLE_AUTO_CONNECT);
    return session.device().empty() && isGiven ? given : session.device();
}

}  // namespace

bool Prom::fail(const std::string& text) const {
    session.say(placeOf(position) + text);
    return false;
}

std::unique_ptr<Chain> Chain::open(Session& session, const std::string& address) {
    const std::optional<DeviceAddress> device = DeviceAddress::read(address);
    if (!device) {
        session.say("TESSAL_DEVICE is neither pipe:NAME nor tcp:PORT: " + quoted(address));
        return nullptr;
    }
    PortLock port;
    if (!session.port().isTaken() && !port.takeDevice(device->text())) {
        session.say(quotedWhereNeeded(address) + ": " + port.failure());
        return nullptr;
    }
    std::unique_ptr<Chain> chain(new Chain(session, *device, std::move(port)));
    if (!chain->m_client.isConnected() || !chain->m_client.identify(chain->m_devices)) {
        session.say("no device answers at " + quotedWhereNeeded(address));
        return nullptr;
    }
    return chain;
}

std::optional<Prom> Chain::findProm(int position) {
    if (position < 0 || position >= static_cast<int>(m_devices.size())) {
        m_session.say(placeOf(position) + "the chain has " + std::to_string(m_devices.size()) + " devices");
        return std::nullopt;
    }
    const std::string& name = m_devices[static_cast<std::size_t>(position)].name;
    const int size = PromUtility::GetExtendedPromSizeByName(name.c_str());
    if (size <= 0) {
        m_session.say(placeOf(position) + quotedWhereNeeded(name) + " is no PROM of the catalogue");
        return std::nullopt;
    }
    return Prom{m_session, m_client, position, size};
}

bool withChain(Session& session, const std::function<bool(Chain&)>& operation) {
    const std::string address = deviceAddress(session);
    if (address.empty()) {
        std::puts("  no device: setcable -port takes pipe:NAME or tcp:PORT of one that is simulated");
        return true;
    }
    const std::unique_ptr<Chain> chain = Chain::open(session, address);
    return chain != nullptr && operation(*chain);
}

bool forEachProm(Session& session, const HkCmdArgs& args, const std::function<bool(Prom&)>& operation) {
    return withChain(session, [&](Chain& chain) {
        for (int i = 0; i < args.valueCount("-p"); ++i) {
            std::optional<Prom> prom = chain.findProm(static_cast<int>(args.integer("-p", i)));
            if (!prom || !operation(*prom)) {
                return false;
            }
        }
        return true;
    });
}
