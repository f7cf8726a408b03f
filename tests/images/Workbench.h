// A directory with data files, in which the generator runs.
#pragma once

#include <memory>
#include <string>
#include <vector>

#include "CommandSet.h"
#include "MessageRecorder.h"
#include "PromUtility.h"
#include "TemporaryDirectory.h"

/// The bytes that the hex digits stand for; blanks between them do not count.
inline std::string bytes(const std::string& digits) {
    std::string result;
    int high = -1;
    for (const char ch : digits) {
        if (ch != ' ') {
            const int digit = ch <= '9' ? ch - '0' : (ch & 0x5F) - 'A' + 10;
            if (high >= 0) {
                result += static_cast<char>(high * 16 + digit);
            }
            high = high >= 0 ? -1 : digit;
        }
    }
    return result;
}

/// Bytes of no pattern.
inline std::string noise(std::size_t count, unsigned seed = 1) {
    std::string result(count, '\0');
    for (char& ch : result) {
        seed = seed * 1664525U + 1013904223U;
        ch = static_cast<char>(seed >> 24);
    }
    return result;
}

class Workbench : public TemporaryDirectory {
public:
    MessageRecorder messages;

    /// Runs "generate" with these arguments, in which "@" stands for the directory, and files in it, by default.
    bool generate(const std::string& arguments) {
        messages.clear();
        std::string line = "generate -path " + path() + ' ';
        for (const char ch : arguments) {
            line += ch == '@' ? path() + '/' : std::string(1, ch);
        }
        const std::unique_ptr<CommandSet> command(CommandSet::string2CommandSet(line.c_str()));
        return PromUtility::generate(command.get());
    }

    /// All that was reported, without the directory.
    std::string said() const {
        std::string text;
        for (const RecordedMessage& message : messages.all()) {
            text += message.level == HkMessageLevel::Debug ? "" : message.text;
        }
        for (std::size_t at = 0; (at = text.find(path() + '/')) != std::string::npos;) {
            text.erase(at, path().size() + 1);
        }
        return text;
    }
};
