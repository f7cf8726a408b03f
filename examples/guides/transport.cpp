// The program of docs/transport.md: one message there, one answer back, over a pipe between two ends.

#include <TessalUtility.h>

#include <cstdio>
#include <string>
#include <thread>

namespace {

constexpr int longestName = 1024;

/// Reads a string: its length is bounded before anything is done with it. False where the peer is gone or lies.
bool readString(TessalPortMux& link, std::string& text) {
    int length = -1;
    link.readInt(&length);
    if (length < 0 || length > longestName) {
        return false;
    }
    text.resize(static_cast<std::size_t>(length));
    return link.read(text.data(), length);
}

void serve(TessalPipe& pipe) {
    TessalPortMux link(true);
    link.setPipeHandle(&pipe);
    std::string name;
    if (pipe.waitForClient() && readString(link, name)) {
        link.writeInt(static_cast<int>(name.size()));
        link.writeBool(name == "erase");
    }
}

bool ask(TessalPipe& pipe) {
    TessalPortMux link(true);
    link.setPipeHandle(&pipe);
    DataBuffer message(64);
    message.writeString("erase");
    int length = 0;
    bool isKnown = false;
    if (!link.writeSocket(message.getBuffer(), message.getLength())) {
        return false;
    }
    link.readInt(&length);
    if (!link.readBool(&isKnown)) {
        return false;
    }
    std::printf("length %d, known %s\n", length, isKnown ? "yes" : "no");
    return length == 5 && isKnown;
}

}  // namespace

int main(int argc, char** argv) {
    const char* const name = argc > 1 ? argv[1] : "\\\\.\\pipe\\tessal_guide";
    TessalPipe server(0, name);
    TessalPipe client(1, name);
    if (!server.initialize() || !client.initialize()) {
        std::fputs("the pipe cannot be set up\n", stderr);
        return 1;
    }
    std::thread serving([&] { serve(server); });
    const bool isAnswered = ask(client);
    serving.join();
    return isAnswered ? 0 : 1;
}
