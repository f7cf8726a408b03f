// A cable record through a stream: one write and a walk over the buffer against field by field formatted operations.

#include <sstream>
#include <string>

#include "CableInfo.h"
#include "benchmarks/Item.h"

namespace {

constexpr const char* sampleForm = "4\nUSB2\n0\n6000000\n12\nPlatformHexa\n";

/// Streams hold many records behind one another, so that little of the time is their rewinding.
constexpr int recordsInStream = 16;

bool isFirstInStream(int& record) {
    return record++ % recordsInStream == 0;
}

std::istringstream manyRecords() {
    std::string text;
    for (int i = 0; i < recordsInStream; ++i) {
        text += sampleForm;
    }
    return std::istringstream(text);
}

CableInfo sampleCable() {
    CableInfo cable;
    std::istringstream in(sampleForm);
    cable.readStream(in);
    return cable;
}

/// The stream begins with the sample's form.
void requireForm(benchmark::State& state, const std::ostringstream& out) {
    if (out.str().rfind(sampleForm, 0) != 0) {
        state.SkipWithError("the form differs");
    }
}

void writeOurs(benchmark::State& state) {
    CableInfo cable = sampleCable();
    std::ostringstream out;
    int record = 0;
    for (auto _ : state) {
        if (isFirstInStream(record)) {
            out.seekp(0);
        }
        cable.writeStream(out);
        benchmark::DoNotOptimize(out);
    }
    requireForm(state, out);
}

void writeFieldByField(benchmark::State& state) {
    CableInfo cable = sampleCable();
    std::ostringstream out;
    int record = 0;
    for (auto _ : state) {
        if (isFirstInStream(record)) {
            out.seekp(0);
        }
        const std::string port = cable.getPortName();
        const std::string name = cable.getCableName();
        out << port.size() << '\n' << port << '\n';
        out << cable.getPortNumber() << '\n' << cable.getPortSpeed() << '\n';
        out << name.size() << '\n' << name << '\n';
        benchmark::DoNotOptimize(out);
    }
    requireForm(state, out);
}

void requireSample(benchmark::State& state, CableInfo& cable) {
    std::ostringstream out;
    cable.writeStream(out);
    requireForm(state, out);
}

void rewindAtFirst(std::istringstream& in, int& record) {
    if (isFirstInStream(record)) {
        in.clear();
        in.seekg(0);
    }
}

void readOurs(benchmark::State& state) {
    std::istringstream in = manyRecords();
    int record = 0;
    CableInfo cable;
    for (auto _ : state) {
        rewindAtFirst(in, record);
        cable.readStream(in);
        benchmark::DoNotOptimize(cable);
    }
    requireSample(state, cable);
}

void readFieldByField(benchmark::State& state) {
    std::istringstream in = manyRecords();
    int record = 0;
    CableInfo cable;
    std::string port;
    std::string name;
    for (auto _ : state) {
        rewindAtFirst(in, record);
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
    requireSample(state, cable);
}

const RegisterItem writeItem{
    {"record_write", {"CableInfo", writeOurs}, {{"ostringstream fields", writeFieldByField}}, {}, 0.33, 0}};
const RegisterItem readItem{
    {"record_read", {"CableInfo", readOurs}, {{"istringstream fields", readFieldByField}}, {}, 0.33, 0}};

}  // namespace
