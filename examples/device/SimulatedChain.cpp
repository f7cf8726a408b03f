#include "SimulatedChain.h"

#include <algorithm>
#include <chrono>
#include <cstdlib>
#include <thread>

namespace {

struct Device {
    const char* name;  ///< a PROM's is that of the catalogue
    int idCode;
    int promSize;  ///< in bytes; 0 for a device that is no PROM
};

constexpr Device devices[] = {
    {"zqr16p", 0x05045093, 2 << 20},
    {"zqr128x", 0x05046093, 16 << 20},
    {"sim-logic", 0x02A20093, 0},
};

bool sendResult(DeviceLink& link, const DeviceRequest& request, DeviceAnswer::Result result) {
    DeviceAnswer answer(request.getId());
    answer.result = result;
    return link.send(answer);
}

bool sendChain(DeviceLink& link) {
    ChainAnswer answer(DeviceRequest::Identify);
    for (const Device& device : devices) {
        answer.devices.push_back({device.name, device.idCode});
    }
    return link.send(answer);
}

/// As a cable that is pulled, or a device whose power fails.
[[noreturn]] void vanish() {
    std::_Exit(EXIT_FAILURE);
}

}  // namespace

SimulatedChain::SimulatedChain(const std::string& contentFile, const Faults& faults) : m_faults(faults) {
    for (const Device& device : devices) {
        const std::string suffix = m_proms.empty() ? "" : '.' + std::to_string(m_proms.size() + 1);
        const std::string file = contentFile.empty() ? "" : contentFile + suffix;
        m_proms.push_back(device.promSize > 0 ? std::make_unique<PromContent>(file, device.promSize) : nullptr);
    }
}

bool SimulatedChain::serve(DeviceLink& link) {
    DeviceRequest request;
    while (link.receive(request)) {
        if (request.getId() == DeviceRequest::Quit) {
            sendResult(link, request, DeviceAnswer::Done);
            return true;
        }
        if (!answer(request, link)) {
            break;
        }
    }
    return false;
}

bool SimulatedChain::answer(const DeviceRequest& request, DeviceLink& link) {
    switch (request.getId()) {
        case DeviceRequest::Identify:
            return sendChain(link);
        case DeviceRequest::Erase:
            return erase(request, link);
        case DeviceRequest::ProgramBlock:
            return program(request, link);
        case DeviceRequest::ReadBlock:
            return read(request, link);
        default:
            return false;
    }
}

bool SimulatedChain::erase(const DeviceRequest& request, DeviceLink& link) {
    DeviceAnswer::Result result = check(request);
    if (result == DeviceAnswer::Done && !m_proms[static_cast<std::size_t>(request.position)]->erase()) {
        result = DeviceAnswer::NotStored;
    }
    return sendResult(link, request, result);
}

bool SimulatedChain::program(const DeviceRequest& request, DeviceLink& link) {
    if (request.length < 0 || request.length > longestBlock) {
        return false;  // where the next message begins cannot be known
    }
    std::vector<unsigned char> block(static_cast<std::size_t>(request.length));
    const int allowed = spend(request.length);
    if (!link.receiveBlock(block.data(), allowed)) {
        return false;
    }
    if (allowed < request.length) {
        vanish();
    }
    DeviceAnswer::Result result = check(request);
    if (result == DeviceAnswer::Done &&
        !m_proms[static_cast<std::size_t>(request.position)]->program(request.offset, block)) {
        result = DeviceAnswer::NotStored;
    }
    return sendResult(link, request, result);
}

bool SimulatedChain::read(const DeviceRequest& request, DeviceLink& link) {
    const DeviceAnswer::Result result = check(request);
    if (result != DeviceAnswer::Done) {
        return sendResult(link, request, result);
    }
    std::vector<unsigned char> block =
        m_proms[static_cast<std::size_t>(request.position)]->read(request.offset, request.length);
    flip(request.offset, block);
    DeviceAnswer answer(request.getId());
    answer.length = request.length;
    const int allowed = spend(request.length);
    const bool isSent = link.send(answer, block.data(), allowed);
    if (allowed < request.length) {
        vanish();
    }
    return isSent;
}

/// What speaks against a request. An erasure has an empty block.
DeviceAnswer::Result SimulatedChain::check(const DeviceRequest& request) const {
    if (request.position < 0 || request.position >= static_cast<int>(m_proms.size())) {
        return DeviceAnswer::NoPosition;
    }
    const PromContent* const prom = m_proms[static_cast<std::size_t>(request.position)].get();
    if (prom == nullptr) {
        return DeviceAnswer::NoProm;
    }
    const bool fits = request.length <= longestBlock && prom->holds(request.offset, request.length);
    return fits ? DeviceAnswer::Done : DeviceAnswer::OutOfRange;
}

void SimulatedChain::flip(int offset, std::vector<unsigned char>& block) const {
    const std::int64_t byte = m_faults.flippedBit / 8 - offset;
    if (m_faults.flippedBit >= 0 && byte >= 0 && byte < static_cast<std::int64_t>(block.size())) {
        block[static_cast<std::size_t>(byte)] ^= static_cast<unsigned char>(1 << m_faults.flippedBit % 8);
    }
}

/// Takes the time of a block; gives how many of its bytes still go through.
int SimulatedChain::spend(int length) {
    std::this_thread::sleep_for(std::chrono::microseconds(m_faults.slowness));
    if (m_faults.vanishAfter == Faults::never) {
        return length;
    }
    const int allowed = static_cast<int>(std::min<std::int64_t>(length, m_faults.vanishAfter));
    m_faults.vanishAfter -= allowed;
    return allowed;
}
