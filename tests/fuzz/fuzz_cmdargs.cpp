// The first line is a format, each further line an argument. Everything that can be asked is asked.
#include <cstdint>
#include <cstdlib>
#include <sstream>
#include <string>
#include <vector>

#include "HkCmdArgs.h"

namespace {

void require(bool condition) {
    if (!condition) {
        std::abort();
    }
}

void readAll(const HkCmdArgs& args, const HkCmdArgInfo& info) {
    const char* const name = info.names[0];
    require(static_cast<int>(args.list(name).size()) == args.valueCount(name));
    require(args.isGiven(name) || args.valueCount(name) == 0);
    for (int i = -1; i <= args.valueCount(name); ++i) {
        args.integer(name, i);
        args.hex(name, i);
        args.groupText(name, args.groupLeader(name, i), i);
        args.groupHas(name, args.text(name, i), i);
    }
    if (args.iserror() == 0) {
        require(args.isGiven(name) || !info.required);
        require(args.count(name) < 2 || info.repeated || info.list);
    }
}

}  // namespace

extern "C" int LLVMFuzzerTestOneInput(const std::uint8_t* data, std::size_t size) {
    std::istringstream lines(std::string(reinterpret_cast<const char*>(data), size));
    std::string format;
    std::getline(lines, format);
    std::vector<std::string> words{"command"};
    for (std::string line; std::getline(lines, line);) {
        words.push_back(line);
    }
    std::vector<const char*> argv;
    for (const std::string& word : words) {
        argv.push_back(word.c_str());
    }
    const int argc = static_cast<int>(argv.size());

    const HkCmdArgs args(argc, argv.data(), format.c_str(), nullptr, HkCmdArgs::Quiet);
    require((args.iserror() != 0) == (args.errorCount() > 0));
    require(HkCmdArgs::checkFormat(format.c_str()).IsEmpty() || args.iserror() != 0);
    for (const HkCmdArgInfo& info : HkCmdArgs::describe(format.c_str())) {
        readAll(args, info);
    }
    args.order();
    args.help();
    HkCmdArgs::complete(argc, argv.data(), format.c_str());
    return 0;
}
