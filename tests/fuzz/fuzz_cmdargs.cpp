// The first line is a format, each further line an argument. Everything that can be asked is asked.
#include <string>
#include <vector>

#include "HkCmdArgs.h"
#include "fuzz/Fuzz.h"

namespace {

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

void fuzz(Input input) {
    const std::string format = input.line();
    std::vector<std::string> words{"command"};
    while (!input.isEmpty()) {
        words.push_back(input.line());
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
}
