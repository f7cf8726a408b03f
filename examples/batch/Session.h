// The road of one batch line.
#pragma once

#include <TessalUtility.h>

#include <array>
#include <map>
#include <string>

#include "Messages.h"
#include "PortLock.h"

/// Takes batch lines one by one: each is split into tokens, looked up, checked against its format, shown with its
/// values, and carried out where there is a handler for it.
///
/// A line that begins with `!` is one that must be refused, so that a script can show faults and still end well.
class Session {
public:
    enum class Outcome { Nothing, Done, Refused, RefusedAsExpected };

    /// @param isPrompt a person types: a command that does something itself is not shown first
    Session(Messages& messages, bool isPrompt) : m_messages(messages), m_isPrompt(isPrompt) {}

    /// Takes one line. A line that is refused has been reported.
    Outcome take(const std::string& line, int number);

    /// How many lines have come to this.
    int count(Outcome outcome) const { return m_counts[static_cast<std::size_t>(outcome)]; }

    /// Ends the run behind the current line.
    void end() { m_hasEnded = true; }
    bool hasEnded() const { return m_hasEnded; }

    /// Reports a word that is no command, with the nearest one that is.
    void sayUnknown(const char* word) const;
    /// Reports something about the current line.
    void say(const std::string& text) const { m_messages.say(text); }

    /// The tokens of the current line, for operations of the library that take them.
    CommandSet& tokens() { return *m_tokens; }

    /// Where the device serves that the cable leads to; empty for none.
    const std::string& device() const { return m_device; }
    void setDevice(const std::string& address) { m_device = address; }

    /// The port of the cable.
    PortLock& port() { return m_port; }
    /// Gives the port back and forgets the device.
    void leaveCable();

    /// The file that the device at a position is programmed with; empty for none.
    std::string& assignedFile(int position) { return m_files[position]; }

private:
    Outcome takeText(const std::string& text);
    bool runCommand(CommandSet& commands);
    void show(const std::string& echo) const;

    Messages& m_messages;
    bool m_isPrompt;
    bool m_hasEnded = false;
    int m_number = 0;
    CommandSet* m_tokens = nullptr;
    std::string m_device;
    PortLock m_port;
    std::map<int, std::string> m_files;
    std::array<int, 4> m_counts{};
};
