#include "DeviceLink.h"

#include <cstdlib>
#include <locale>
#include <sstream>

namespace {

constexpr int longestMessage = 64 * 1024;
constexpr int highestPort = 65535;
constexpr char pipePrefix[] = "\\\\.\\pipe\\";

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

bool DeviceLink::send(NetMessage& message, const unsigned char* block, int length) {
    std::ostringstream form;
    form.imbue(std::locale::classic());
    message.writeStream(form);
    const std::string text = form.str();
    DataBuffer buffer(static_cast<int>(text.size()) + WireForm::intSize + length);
    buffer.writeString(text.c_str());
    buffer.write(reinterpret_cast<const char*>(block), length);
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

bool DeviceLink::receiveBlock(unsigned char* block, int length) {
    return m_mux.read(reinterpret_cast<char*>(block), length);
}
