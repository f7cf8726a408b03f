// A cable record through a stream: one write and a walk over the buffer against field by field formatted operations.

#include <sstream>
#include <string>

#include "CableInfo.h"
#include "benchmarks/Item.h"

namespace {

constexpr const char* sampleForm = "4\nUSB2\n0\n6000000\n12\nPlatformHexa\n";

CableInfo sampleCable() {
    CableInfo cable;
    std::istringstream in(sampleForm);
    cable.readStream(in);
    return cable;
}

void writeOurs(benchmark::State& state) {
    CableInfo cable = sampleCable();
    std::ostringstream out;
    for (auto _ : state) {
        out.seekp(0);
        cable.writeStream(out);
        benchmark::DoNotOptimize(out);
    }
    if (out.str() != sampleForm) {
        state.SkipWithError("the form differs");
    }
}

void writeFieldByField(benchmark::State& state) {
    CableInfo cable = sampleCable();
    std::ostringstream out;
    for (auto _ : state) {
        out.seekp(0);
        const std::string port = cable.getPortName();
        const std::string name = cable.getCableName();
        out << port.size() << '\n' << port << '\n';
        out << cable.getPortNumber() << '\n' << cable.getPortSpeed() << '\n';
        out << name.size() << '\n' << name << '\n';
        benchmark::DoNotOptimize(out);
    }
    if (out.str() != sampleForm) {
        state.SkipWithError("the form differs");
    }
}

void readOurs(benchmark::State& state) {
    std::istringstream in(sampleForm);
    CableInfo cable;
    for (auto _ : state) {
        in.clear();
        in.seekg(0);
        cable.readStream(in);
        benchmark::DoNotOptimize(cable);
    }
}

void readFieldByField(benchmark::State& state) {
    std::istringstream in(sampleForm);
    CableInfo cable;
    std::string port;
    std::string name;
    for (auto _ : state) {
        in.clear();
        in.seekg(0);
        int length = 0;
        int number = 0;
        int speed = 0;
        in >> length >> port >> number >> speed >> length >> name;
        cable.setPortName(port.c_str());
        cable.setPortNumber(number);
        cable.setPortSpeed(speed);
        cable.setCableName(name.c_str());
        benchmark::DoNotOptimize(cable);
    }
}

const RegisterItem writeItem{
    {"record_write", {"CableInfo", writeOurs}, {{"ostringstream fields", writeFieldByField}}, {}, 0.33, 0}};
const RegisterItem readItem{
    {"record_read", {"CableInfo", readOurs}, {{"istringstream fields", readFieldByField}}, {}, 0.33, 0}};

}  // namespace
