#include "DeviceLink.h"

#include <chrono>
#include <cstdlib>
#include <locale>
#include <sstream>
#include <thread>

namespace {

constexpr int longestMessage = 64 * 1024;
constexpr int highestPort = 65535;
constexpr char pipePrefix[] = "\\\\.\\pipe\\";

// A device that has just lost a client makes its pipe anew.
constexpr int attempts = 100;
constexpr std::chrono::milliseconds pauseBetweenAttempts{20};

bool startsWith(const std::string& text, const char* start) {
    return text.rfind(start, 0) == 0;
}

std::optional<DeviceAddress> readPipe(const std::string& name) {
    if (name.empty()) {
        return std::nullopt;
    }
    DeviceAddress address;
    address.pipe = name[0] == '/' || name[0] == '\\' ? name : pipePrefix + name;
    return address;
}

std::optional<DeviceAddress> readPort(const std::string& digits) {
    DeviceAddress address;
    address.port = std::atoi(digits.c_str());
    const bool isNumber = !digits.empty() && digits.find_first_not_of("0123456789") == std::string::npos;
    return isNumber && digits.size() <= 5 && address.port <= highestPort ? std::optional(address) : std::nullopt;
}

bool ask(DeviceLink link, DeviceRequest::Kind kind, ChainAnswer& answer) {
    DeviceRequest request(kind);
    return link.send(request) && link.receive(answer) && answer.getId() == kind;
}

bool connect(TessalPipe& client) {
    for (int left = attempts; left > 0; --left) {
        if (client.initialize()) {
            return true;
        }
        std::this_thread::sleep_for(pauseBetweenAttempts);
    }
    return false;
}

}  // namespace

std::optional<DeviceAddress> DeviceAddress::read(const std::string& text) {
    if (startsWith(text, "pipe:")) {
        return readPipe(text.substr(5));
    }
    return startsWith(text, "tcp:") ? readPort(text.substr(4)) : std::nullopt;
}

std::string DeviceAddress::text() const {
    if (pipe.empty()) {
        return "tcp:" + std::to_string(port);
    }
    return "pipe:" + (startsWith(pipe, pipePrefix) ? pipe.substr(sizeof pipePrefix - 1) : pipe);
}

bool DeviceLink::send(NetMessage& message) {
    std::ostringstream form;
    form.imbue(std::locale::classic());
    message.writeStream(form);
    const std::string text = form.str();
    DataBuffer buffer(static_cast<int>(text.size()) + 4);
    buffer.writeString(text.c_str());
    return m_mux.writeSocket(buffer.getBuffer(), buffer.getLength());
}

bool DeviceLink::receive(NetMessage& message) {
    int length = 0;
    m_mux.readInt(&length);
    if (length < 1 || length > longestMessage) {
        return false;
    }
    std::string text(static_cast<std::size_t>(length), '\0');
    if (!m_mux.read(text.data(), length)) {
        return false;
    }
    std::istringstream form(text);
    form.imbue(std::locale::classic());
    message.readStream(form);
    return !form.fail();
}

bool askDevice(const DeviceAddress& address, DeviceRequest::Kind kind, ChainAnswer& answer) {
    if (!address.pipe.empty()) {
        TessalPipe client(1, address.pipe.c_str());
        return connect(client) && ask(DeviceLink(client), kind, answer);
    }
    TessalSocket client(1, "127.0.0.1", address.port);
    return client.connectToServer() && ask(DeviceLink(client), kind, answer);
}
