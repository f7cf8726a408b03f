#include "DeviceCall.h"

#include <TessalUtility.h>

#include <vector>

namespace {

constexpr const char* program = "tessal_device";

constexpr const char* format =
    "'Simulates a chain of devices and serves one client after the other. The address is printed when the device is "
    "ready and in the form that setcable -port takes.'"
    "{ --pipe <name=text> 'serve over a pipe of this name'"
    "  --tcp <port=int 0..65535> 'serve on this port; 0 takes a free one'"
    "  -h|--help 'print this text' }"
    "[--quit] 'end the device that serves there'"
    "[--content <file=file>] 'keep the content of the first PROM in this file and that of the second in FILE.2'"
    "[--flip-bit <bit=int 0..>] 'this bit of a PROM reads inverted; 8 * byte + bit'"
    "[--vanish-after <bytes=int 0..>] 'end the process when so many bytes have been programmed or read'"
    "[--slow <microseconds=int 0..60000000>] 'time that each block takes'";

}  // namespace

DeviceCall readDeviceCall(int argc, char** argv) {
    std::vector<const char*> words(argv, argv + argc);
    words.resize(words.empty() ? 1 : words.size());
    words[0] = program;
    const HkCmdArgs args(static_cast<int>(words.size()), words.data(), format, nullptr, 0);
    DeviceCall call;
    if (args.iserror() != 0) {
        return call;
    }
    call.isHelp = args.isGiven("-h");
    call.isQuit = args.isGiven("--quit");
    const char* const pipe = args.text("--pipe");
    call.address = DeviceAddress::read(pipe != nullptr ? std::string("pipe:") + pipe
                                                       : std::string("tcp:") + args.text("--tcp", 0, ""));
    call.contentFile = args.text("--content", 0, "");
    call.faults.flippedBit = args.integer("--flip-bit", 0, Faults::never);
    call.faults.vanishAfter = args.integer("--vanish-after", 0, Faults::never);
    call.faults.slowness = args.integer("--slow");
    return call;
}

std::string deviceCallHelp() {
    return HkCmdArgs::help(program, format).c_str();
}
