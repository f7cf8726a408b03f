#include "DeviceMessages.h"

#include <istream>
#include <ostream>

namespace {

constexpr int longestChain = 64;

}  // namespace

void DeviceRequest::readStream(std::istream& in) {
    NetMessage::readStream(in);
    in >> position >> offset >> length;
}

void DeviceRequest::writeStream(std::ostream& out) {
    NetMessage::writeStream(out);
    out << position << '\n' << offset << '\n' << length << '\n';
}

void DeviceAnswer::readStream(std::istream& in) {
    NetMessage::readStream(in);
    in >> result >> length;
}

void DeviceAnswer::writeStream(std::ostream& out) {
    NetMessage::writeStream(out);
    out << result << '\n' << length << '\n';
}

void ChainAnswer::readStream(std::istream& in) {
    NetMessage::readStream(in);
    int count = 0;
    in >> count;
    if (count < 0 || count > longestChain) {
        in.setstate(std::ios::failbit);
    }
    devices.clear();
    while (in && static_cast<int>(devices.size()) < count) {
        NetString name;
        ChainDevice device;
        name.readStream(in);
        in >> device.idCode;
        if (in) {
            device.name = name.getString();
            devices.push_back(device);
        }
    }
}

void ChainAnswer::writeStream(std::ostream& out) {
    NetMessage::writeStream(out);
    out << devices.size() << '\n';
    for (const ChainDevice& device : devices) {
        NetString name;
        name.setString(device.name.c_str());
        name.writeStream(out);
        out << device.idCode << '\n';
    }
}
