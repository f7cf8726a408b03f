// Writes a parsed command and its errors as text, one line for each thing, as docs/argument-format.md shows them.
#pragma once

#include <algorithm>
#include <iomanip>
#include <sstream>
#include <string>
#include <vector>

#include "HkCmdArgs.h"

using Lines = std::vector<std::string>;

/// Splits at blanks; double quotes round a word hold it together.
inline Lines splitCommand(const std::string& line) {
    Lines words;
    std::istringstream in(line);
    for (std::string word; in >> std::quoted(word);) {
        words.push_back(word);
    }
    return words;
}

/// The words as a program gets them; they live as long as @p words.
inline std::vector<const char*> pointersTo(const Lines& words) {
    std::vector<const char*> pointers(words.size());
    std::transform(words.begin(), words.end(), pointers.begin(), [](const std::string& word) { return word.c_str(); });
    return pointers;
}

inline HkCmdArgs parsed(const char* format, const Lines& words, unsigned short flags = HkCmdArgs::Quiet,
                        void (*callback)() = nullptr) {
    return HkCmdArgs(static_cast<int>(words.size()), pointersTo(words).data(), format, callback, flags);
}

inline std::string groupDump(const HkCmdArgs& args, const HkCmdArgInfo& info, const char* format, int index) {
    std::string text = "{" + std::string(args.groupLeader(info.names[0], index).view());
    // The members are not part of the description: ask for each word that the format holds.
    for (const std::string& word : splitCommand(format)) {
        const std::string member = word.substr(0, word.find_first_of("*>"));
        if (args.groupHas(info.names[0], member.c_str(), index) && text.find(" " + member) == std::string::npos) {
            const bool hasText = word.find('*') != std::string::npos;
            const std::string carried(args.groupText(info.names[0], member.c_str(), index).view());
            text += " " + member + (hasText ? "(" + carried + ")" : "");
        }
    }
    return text + "}";
}

inline std::string dumpOne(const HkCmdArgs& args, const HkCmdArgInfo& info, const char* format) {
    const char* const name = info.names[0];
    std::string line = *name != '\0' ? name : "\"\"";
    if (args.count(name) > 1 && info.kind != HkCmdArgInfo::Kind::Positional) {
        line += " x" + std::to_string(args.count(name));
    }
    for (int i = 0; i < args.valueCount(name); ++i) {
        const bool isGroup = info.type == HkCmdArgInfo::Type::Group;
        line += i == 0 ? " = " : " ";
        line += isGroup ? groupDump(args, info, format, i) : args.text(name, i);
    }
    return line;
}

/// The errors, each behind "! "; without errors what was given, in the order of the command.
inline Lines dump(const HkCmdArgs& args, const char* format) {
    Lines lines;
    for (const HkString& error : args.errors()) {
        lines.push_back("! " + std::string(error.view()));
    }
    if (!lines.empty()) {
        return lines;
    }
    const std::vector<HkCmdArgInfo> infos = HkCmdArgs::describe(format);
    for (const HkString& name : args.order()) {
        const auto info =
            std::find_if(infos.begin(), infos.end(), [&](const auto& one) { return one.names[0] == name; });
        const std::string line = dumpOne(args, *info, format);
        if (std::find(lines.begin(), lines.end(), line) == lines.end()) {
            lines.push_back(line);
        }
    }
    return lines;
}

/// What a command line gives.
inline Lines parse(const char* format, const std::string& line) {
    return dump(parsed(format, splitCommand(line)), format);
}
