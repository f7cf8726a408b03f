// Messages put together and taken apart in memory.

#include <algorithm>
#include <cstdlib>
#include <sstream>
#include <string>
#include <string_view>
#include <vector>

#include "DataBuffer.h"
#include "Item.h"
#include "WireForm.h"

namespace {

using State = benchmark::State;

constexpr int numbers = 4096;
constexpr int messageSize = numbers * WireForm::intSize;
constexpr int growingNumbers = 1 << 16;

int valueAt(int index) {
    return index * 7919;
}

/// The message as it must be, made once.
const std::string& expectedMessage() {
    static const std::string message = [] {
        std::string bytes(messageSize, '\0');
        for (int i = 0; i < numbers; ++i) {
            WireForm::storeInt(bytes.data() + i * WireForm::intSize, valueAt(i));
        }
        return bytes;
    }();
    return message;
}

void mustBeMessage(State& state, const char* bytes, std::size_t size) {
    if (std::string_view(bytes, size) != expectedMessage()) {
        state.SkipWithError("other bytes than expected");
    }
}

template <class Write>
void writeMessages(State& state, Write write, const char* bytes) {
    write(0);
    mustBeMessage(state, bytes, messageSize);
    int factor = 0;
    for (auto _ : state) {
        benchmark::DoNotOptimize(factor);
        write(factor);
        benchmark::ClobberMemory();
    }
}

void writeOurs(State& state) {
    DataBuffer buffer(messageSize);
    const auto write = [&](int added) {
        buffer.reset();
        for (int i = 0; i < numbers; ++i) {
            buffer.writeInt(valueAt(i) + added);
        }
    };
    writeMessages(state, write, buffer.getBuffer());
}

void writeByAppending(State& state) {
    std::string message;
    message.reserve(messageSize);
    const auto write = [&](int added) {
        message.clear();
        for (int i = 0; i < numbers; ++i) {
            char bytes[WireForm::intSize];
            WireForm::storeInt(bytes, valueAt(i) + added);
            message.append(bytes, sizeof bytes);
        }
    };
    writeMessages(state, write, message.data());
}

void writeByStoring(State& state) {
    std::vector<char> message(messageSize);
    char* const bytes = message.data();
    const auto write = [bytes](int added) {
        for (int i = 0; i < numbers; ++i) {
            WireForm::storeInt(bytes + i * WireForm::intSize, valueAt(i) + added);
        }
    };
    writeMessages(state, write, bytes);
}

const RegisterItem writeItem{{"buffer_write_ints",
                              {"DataBuffer", writeOurs},
                              {{"string append", writeByAppending}},
                              {"store loop", writeByStoring},
                              0.25,
                              3.00}};

void growOurs(State& state) {
    for (auto _ : state) {
        DataBuffer buffer(0);
        for (int i = 0; i < growingNumbers; ++i) {
            buffer.writeInt(valueAt(i));
        }
        benchmark::DoNotOptimize(buffer.getBuffer());
        benchmark::ClobberMemory();
        if (buffer.getLength() != growingNumbers * WireForm::intSize ||
            WireForm::loadInt(buffer.getBuffer() + buffer.getLength() - WireForm::intSize) !=
                valueAt(growingNumbers - 1)) {
            state.SkipWithError("other bytes than expected");
        }
    }
}

void growByChain(State& state) {
    constexpr int margin = 1024;
    for (auto _ : state) {
        char* bytes = nullptr;
        int capacity = 0;
        for (int i = 0; i < growingNumbers;) {
            capacity += WireForm::intSize + margin;
            bytes = static_cast<char*>(std::realloc(bytes, static_cast<std::size_t>(capacity)));
            for (const int end = std::min(capacity / WireForm::intSize, growingNumbers); i < end; ++i) {
                WireForm::storeInt(bytes + i * WireForm::intSize, valueAt(i));
            }
        }
        benchmark::DoNotOptimize(bytes);
        benchmark::ClobberMemory();
        std::free(bytes);
    }
}

const RegisterItem growItem{
    {"buffer_write_growing", {"DataBuffer", growOurs}, {}, {"realloc chain, stores", growByChain}, 0, 2.00}};

int expectedSum() {
    unsigned int sum = 0;
    for (int i = 0; i < numbers; ++i) {
        sum += static_cast<unsigned int>(valueAt(i));
    }
    return static_cast<int>(sum);
}

template <class Sum>
void readMessages(State& state, Sum sum) {
    if (sum() != expectedSum()) {
        state.SkipWithError("other numbers than expected");
    }
    for (auto _ : state) {
        benchmark::ClobberMemory();
        benchmark::DoNotOptimize(sum());
    }
}

/// Adds up what next() gives, number by number as fields of a message are used: not several in one vector.
template <class Next>
int sumOf(Next next) {
    unsigned int sum = 0;
    for (int i = 0; i < numbers; ++i) {
        int value = next(i);
        benchmark::DoNotOptimize(value);
        sum += static_cast<unsigned int>(value);
    }
    return static_cast<int>(sum);
}

void readOurs(State& state) {
    DataBuffer buffer(messageSize);
    buffer.write(expectedMessage().data(), messageSize);
    readMessages(state, [&] {
        buffer.reset();
        return sumOf([&](int) { return buffer.readInt(); });
    });
}

void readByStringbuf(State& state) {
    std::stringbuf buffer(expectedMessage());
    readMessages(state, [&] {
        buffer.pubseekpos(0, std::ios::in);
        return sumOf([&](int) {
            char bytes[WireForm::intSize] = {};
            buffer.sgetn(bytes, sizeof bytes);
            return WireForm::loadInt(bytes);
        });
    });
}

void readByLoading(State& state) {
    std::string message = expectedMessage();
    benchmark::DoNotOptimize(message.data());
    readMessages(
        state, [&] { return sumOf([&](int i) { return WireForm::loadInt(message.data() + i * WireForm::intSize); }); });
}

const RegisterItem readItem{{"buffer_read_ints",
                             {"DataBuffer", readOurs},
                             {{"stringbuf", readByStringbuf}},
                             {"load loop", readByLoading},
                             0.20,
                             2.00}};

}  // namespace
