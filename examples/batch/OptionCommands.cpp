#include "OptionCommands.h"

#include <cstdio>
#include <string>
#include <vector>

#include "OptionReader.h"
#include "Quoting.h"

namespace {

/// The rows of an operation and what gives its arguments.
struct Operation {
    const char* command;
    int first;
    int last;
    std::vector<HkString> (DeviceOptionsMgr::*options)() const;
};

constexpr Operation operations[] = {
    {"program", 0, 67, &DeviceOptionsMgr::getProgramOptions},
    {"erase", 67, 81, &DeviceOptionsMgr::getEraseOptions},
    {"readback", 81, 83, &DeviceOptionsMgr::getReadbackOptions},
    {"verify", 84, 92, &DeviceOptionsMgr::getVerifyOptions},
    {"custcode", 94, 102, &DeviceOptionsMgr::getCustCodeOptions},
};

const Operation* findOperation(const char* command) {
    for (const Operation& operation : operations) {
        if (HkStr::ICompare(operation.command, command) == 0) {
            return &operation;
        }
    }
    return nullptr;
}

void showPreference(TessalPreference& preferences, TessalPreference::PREFERENCE row) {
    std::printf("  %s = %s\n", TessalPreference::pref2String(row), preferences.getPreference(row));
}

}  // namespace

DeviceOptionsMgr takeOptions(const HkCmdArgs& args) {
    DeviceOptionsMgr manager;
    const Operation* const operation = findOperation(args.command());
    if (operation == nullptr) {
        return manager;
    }
    DeviceOptionReader(args, tESSALNS::programOptionRows, manager).read(operation->first, operation->last);
    const std::vector<HkString> options = (manager.*operation->options)();
    std::string line = "  options:";
    for (const HkString& option : options) {
        line += ' ' + quotedWhereNeeded(option.view());
    }
    std::printf("%s\n", options.empty() ? "  options: none" : line.c_str());
    return manager;
}

bool showOptions(Session&, const HkCmdArgs& args) {
    takeOptions(args);
    return true;
}

bool isPreferred(TessalPreference::PREFERENCE row) {
    return TessalPreference::getPreferenceObject()->isPreferenceTrue(row);
}

bool preference(Session&, const HkCmdArgs& args) {
    TessalPreference& preferences = *TessalPreference::getPreferenceObject();
    const char* const name = args.text("name");
    if (name == nullptr) {
        TessalPreference::dump();
        return true;
    }
    try {
        const TessalPreference::PREFERENCE row = TessalPreference::string2Pref(name);
        const char* const value = args.text("value");
        const bool isSet = value == nullptr || preferences.setPreference(row, value);
        showPreference(preferences, row);
        return isSet;
    } catch (const DataNotFoundException&) {
        return false;  // the message has gone out
    }
}
