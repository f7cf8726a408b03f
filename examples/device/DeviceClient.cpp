#include "DeviceClient.h"

#include <chrono>
#include <thread>

namespace {

// A device that has just lost a client makes its pipe anew.
constexpr int attempts = 100;
constexpr std::chrono::milliseconds pauseBetweenAttempts{20};

bool connect(TessalPipe& client) {
    for (int left = attempts; left > 0; --left) {
        if (client.initialize()) {
            return true;
        }
        std::this_thread::sleep_for(pauseBetweenAttempts);
    }
    return false;
}

const char* textOf(int result) {
    switch (result) {
        case DeviceAnswer::NoPosition:
            return "there is no such position in the chain";
        case DeviceAnswer::NoProm:
            return "the device is no PROM";
        case DeviceAnswer::OutOfRange:
            return "the block lies outside the PROM";
        case DeviceAnswer::NotStored:
            return "the device cannot store its content";
        default:
            return "the device refuses";
    }
}

}  // namespace

DeviceClient::DeviceClient(const DeviceAddress& address)
    : m_pipe(1, address.pipe.c_str()),
      m_socket(1, "127.0.0.1", address.port),
      m_link(address.pipe.empty() ? DeviceLink(m_socket) : DeviceLink(m_pipe)),
      m_isConnected(address.pipe.empty() ? m_socket.connectToServer() : connect(m_pipe)) {}

bool DeviceClient::identify(std::vector<ChainDevice>& devices) {
    DeviceRequest request(DeviceRequest::Identify);
    ChainAnswer answer;
    if (!ask(request, answer)) {
        return false;
    }
    devices = answer.devices;
    return true;
}

bool DeviceClient::quit() {
    DeviceRequest request(DeviceRequest::Quit);
    DeviceAnswer answer;
    return ask(request, answer);
}

bool DeviceClient::erase(int position) {
    DeviceRequest request(DeviceRequest::Erase);
    request.position = position;
    DeviceAnswer answer;
    return ask(request, answer) && isDone(answer, 0);
}

bool DeviceClient::program(int position, int offset, const unsigned char* block, int length) {
    DeviceRequest request(DeviceRequest::ProgramBlock);
    request.position = position;
    request.offset = offset;
    request.length = length;
    DeviceAnswer answer;
    return ask(request, answer, block) && isDone(answer, 0);
}

bool DeviceClient::read(int position, int offset, unsigned char* block, int length) {
    DeviceRequest request(DeviceRequest::ReadBlock);
    request.position = position;
    request.offset = offset;
    request.length = length;
    DeviceAnswer answer;
    if (!ask(request, answer) || !isDone(answer, length)) {
        return false;
    }
    return m_link.receiveBlock(block, length) || lose();
}

bool DeviceClient::ask(DeviceRequest& request, NetMessage& answer, const unsigned char* block) {
    const bool hasAnswered =
        m_link.send(request, block, block != nullptr ? request.length : 0) && m_link.receive(answer);
    return (hasAnswered && answer.getId() == request.getId()) || lose();
}

bool DeviceClient::isDone(const DeviceAnswer& answer, int expectedLength) {
    if (answer.result != DeviceAnswer::Done) {
        m_failure = textOf(answer.result);
        return false;
    }
    return answer.length == expectedLength || lose();
}

bool DeviceClient::lose() {
    m_failure = "the device is gone";
    return false;
}
